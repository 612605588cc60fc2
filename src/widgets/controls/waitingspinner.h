#pragma once

#include <QPixmap>
#include <QTimer>
#include <QWidget>

/// A turning ring that says that work is under way; it turns only while it is visible.
class WaitingSpinner : public QWidget {
    Q_OBJECT

public:
    /// picture: the ring, a quarter open or so.
    explicit WaitingSpinner(QWidget *parent = nullptr,
                            const QString &picture = QStringLiteral(":/images/progress_indicator_sm.svg"));

    QSize sizeHint() const override;

protected:
    void paintEvent(QPaintEvent *event) override;
    void showEvent(QShowEvent *event) override;
    void hideEvent(QHideEvent *event) override;

private:
    QString m_picture;
    QTimer m_turn;
    int m_angle = 0;
    QPixmap m_ring;
};
