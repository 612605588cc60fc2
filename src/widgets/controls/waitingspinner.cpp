#include "widgets/controls/waitingspinner.h"

#include "widgets/style/icons.h"

#include <QPainter>

namespace {
constexpr int stepMs = 60;
constexpr int stepDegrees = 24;
} // namespace

WaitingSpinner::WaitingSpinner(QWidget *parent, const QString &picture)
    : QWidget(parent), m_picture(picture) {
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
    m_turn.setInterval(stepMs);
    connect(&m_turn, &QTimer::timeout, this, [this] {
        m_angle = (m_angle + stepDegrees) % 360;
        update();
    });
}

QSize WaitingSpinner::sizeHint() const {
    return {20, 20};
}

void WaitingSpinner::paintEvent(QPaintEvent *) {
    const qreal ratio = devicePixelRatioF();
    if (m_ring.isNull() || m_ring.devicePixelRatio() != ratio ||
        m_ring.deviceIndependentSize().toSize() != size())
        m_ring = Icons::pixmap(m_picture, size(), ratio);
    QPainter painter(this);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    painter.translate(QRectF(rect()).center());
    painter.rotate(m_angle);
    painter.drawPixmap(QPointF(-width() / 2.0, -height() / 2.0), m_ring);
}

void WaitingSpinner::showEvent(QShowEvent *event) {
    QWidget::showEvent(event);
    m_turn.start();
}

void WaitingSpinner::hideEvent(QHideEvent *event) {
    m_turn.stop();
    QWidget::hideEvent(event);
}
