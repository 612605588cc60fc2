#include "widgets/controls/badgebutton.h"

#include "widgets/style/theme.h"

#include <QPainter>

namespace {
constexpr int badgeHeight = 16;
constexpr int most = 999;
} // namespace

void BadgeButton::setBadge(int number) {
    if (number == m_badge)
        return;
    m_badge = number;
    update();
}

void BadgeButton::paintBadge(QPainter &painter, const QRect &place, int number) {
    if (number <= 0)
        return;
    QFont font = painter.font();
    font.setPixelSize(10);
    font.setWeight(QFont::DemiBold);
    const QString text = number > most ? QStringLiteral("%1+").arg(most) : QString::number(number);
    const int width = std::max(badgeHeight, QFontMetrics(font).horizontalAdvance(text) + 8);
    const QRect pill(place.right() - width + 1, place.center().y() - badgeHeight / 2, width, badgeHeight);
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(Theme::error);
    painter.drawRoundedRect(pill, badgeHeight / 2.0, badgeHeight / 2.0);
    painter.setFont(font);
    painter.setPen(Theme::text);
    painter.drawText(pill, Qt::AlignCenter, text);
    painter.restore();
}

void BadgeButton::paintEvent(QPaintEvent *event) {
    QToolButton::paintEvent(event);
    QPainter painter(this);
    // Beside a text, or on the corner of a picture.
    const int top = text().isEmpty() ? 2 : (height() - badgeHeight) / 2;
    paintBadge(painter, QRect(0, top, width() - 1, badgeHeight), m_badge);
}
