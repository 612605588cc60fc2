#pragma once

#include <QFrame>

class QLabel;
class QToolButton;

/// Shows the operations that failed before they had begun, or of which nobody knows whether they have, one
/// after the other. Hidden while there is none.
class FailedTaskBanner : public QFrame {
    Q_OBJECT

public:
    explicit FailedTaskBanner(QWidget *parent = nullptr);

private:
    QToolButton *makeButton(const char *name, const QString &text);
    void showFirst();

    QLabel *m_text;
    QLabel *m_count;
    QToolButton *m_startAgain;
    QToolButton *m_dismiss;
};
