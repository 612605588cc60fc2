#include "widgets/controls/toggleswitch.h"

#include "widgets/style/theme.h"

#include <QPainter>

namespace {

constexpr QSizeF trackSize{36, 20};
constexpr qreal knobSize = 14;
constexpr qreal knobMargin = 3;
constexpr int focusMargin = 3;

QColor trackColour(const QCheckBox &toggle) {
    QColor colour = toggle.isChecked() ? Theme::accent : Theme::switchOff;
    if (!toggle.isEnabled())
        colour.setAlphaF(0.4F);
    return colour;
}

} // namespace

ToggleSwitch::ToggleSwitch(QWidget *parent) : QCheckBox(parent) {
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
}

QSize ToggleSwitch::sizeHint() const {
    return trackSize.toSize() + QSize(2 * focusMargin, 2 * focusMargin);
}

bool ToggleSwitch::hitButton(const QPoint &position) const {
    return rect().contains(position);
}

void ToggleSwitch::paintEvent(QPaintEvent *) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    QRectF track({}, trackSize);
    track.moveCenter(QRectF(rect()).center());
    painter.setPen(Qt::NoPen);
    painter.setBrush(trackColour(*this));
    painter.drawRoundedRect(track, track.height() / 2, track.height() / 2);
    const qreal left = isChecked() ? track.right() - knobMargin - knobSize : track.left() + knobMargin;
    painter.setBrush(isEnabled() ? Theme::text : Theme::textQuiet);
    painter.drawEllipse(QRectF(left, track.top() + knobMargin, knobSize, knobSize));
    if (!hasFocus())
        return;
    painter.setPen(QPen(Theme::text, 1));
    painter.setBrush(Qt::NoBrush);
    const QRectF ring = track.adjusted(-2, -2, 2, 2);
    painter.drawRoundedRect(ring, ring.height() / 2, ring.height() / 2);
}
