#pragma once

#include <QStackedWidget>

class QLabel;

/// The middle of a panel: its list, or in its place a sentence that says why it is empty.
class PanelPage : public QStackedWidget {
    Q_OBJECT

public:
    explicit PanelPage(QWidget *parent = nullptr);

    void setView(QWidget *view);
    void showView() { setCurrentIndex(1); }
    void showText(const QString &text);

private:
    QLabel *m_text;
};
