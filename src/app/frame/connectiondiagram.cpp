#include "app/frame/connectiondiagram.h"

#include "widgets/style/icons.h"
#include "widgets/style/theme.h"

#include <QPainter>

namespace {

constexpr QSize partSize{72, 72};
constexpr QSize markSize{20, 20};
constexpr int lineLength = 120;
constexpr int lineMargin = 12;

QColor lineColour(ConnectionDiagram::State state) {
    switch (state) {
    case ConnectionDiagram::State::Connected:
        return Theme::success;
    case ConnectionDiagram::State::Interrupted:
        return Theme::warning;
    default:
        return Theme::textOff;
    }
}

QString markOf(ConnectionDiagram::State state) {
    return state == ConnectionDiagram::State::Connected
               ? QStringLiteral(":/images/icon_general_success_solid_green.svg")
               : QStringLiteral(":/images/icon_general_warning_solid.svg");
}

} // namespace

ConnectionDiagram::ConnectionDiagram(QWidget *parent) : QWidget(parent) {
    setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
}

void ConnectionDiagram::setState(State state) {
    m_state = state;
    update();
}

QSize ConnectionDiagram::sizeHint() const {
    return {2 * partSize.width() + lineLength, partSize.height()};
}

void ConnectionDiagram::paintEvent(QPaintEvent *) {
    QPainter painter(this);
    const qreal ratio = devicePixelRatioF();
    const QPoint centre = rect().center();
    const QPoint left(centre.x() - lineLength / 2, centre.y());
    const QPoint right(centre.x() + lineLength / 2, centre.y());
    const auto draw = [&](const QString &name, QSize size, QPoint topLeft) {
        painter.drawPixmap(topLeft, Icons::pixmap(name, size, ratio));
    };
    const int top = centre.y() - partSize.height() / 2;
    draw(QStringLiteral(":/images/service_manage_dm.svg"), partSize, {left.x() - partSize.width(), top});
    draw(QStringLiteral(":/images/service_manage_cloud.svg"), partSize, {right.x(), top});
    painter.setPen(QPen(lineColour(m_state), 2, m_state == State::Connected ? Qt::SolidLine : Qt::DashLine));
    painter.drawLine(left + QPoint(lineMargin, 0), right - QPoint(lineMargin, 0));
    if (m_state == State::Unknown)
        return;
    QRect mark({}, markSize);
    mark.moveCenter(centre);
    painter.fillRect(mark.adjusted(-6, 0, 6, 0), Theme::raised);
    draw(markOf(m_state), markSize, mark.topLeft());
}
