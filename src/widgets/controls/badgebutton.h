#pragma once

#include <QToolButton>

/// A tool button with a number in its upper right corner.
class BadgeButton : public QToolButton {
    Q_OBJECT

public:
    using QToolButton::QToolButton;

    /// 0 shows none.
    void setBadge(int number);
    int badge() const { return m_badge; }

    /// Paints a badge with its right end at the place's right end, in the middle of its height.
    static void paintBadge(QPainter &painter, const QRect &place, int number);

protected:
    void paintEvent(QPaintEvent *event) override;

private:
    int m_badge = 0;
};
