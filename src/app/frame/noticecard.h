#pragma once

#include <QFrame>
#include <QQueue>

class QLabel;
class QPushButton;

/// A text over the lower edge of the frame that stays until the user has put it away. It takes no focus and
/// stops nothing; texts that come meanwhile wait for their turn.
class NoticeCard : public QFrame {
    Q_OBJECT

public:
    explicit NoticeCard(QWidget *frame);

    /// guidePage: what the user guide says about it; empty for nothing.
    void add(const QString &text, const QString &guidePage = {});

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    struct Notice {
        QString text;
        QString guidePage;
    };

    void showFirst();
    void place();

    QQueue<Notice> m_notices; ///< the first one is shown
    QLabel *m_text;
    QPushButton *m_guide;
};
