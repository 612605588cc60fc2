#include "devices/sites/dragtip.h"

#include "widgets/style/theme.h"

#include <QPainter>
#include <QScreen>

namespace {

constexpr QPoint cursorDistance{16, 18};
constexpr QMargins padding{8, 4, 8, 4};

QFont tipFont() {
    QFont font(Theme::fontFamily());
    font.setPixelSize(12);
    return font;
}

} // namespace

DragTip::DragTip(QWidget *parent)
    : QWidget(parent, Qt::ToolTip | Qt::FramelessWindowHint | Qt::WindowTransparentForInput |
                          Qt::WindowDoesNotAcceptFocus | Qt::NoDropShadowWindowHint) {
    setObjectName(QStringLiteral("dragTip"));
    setAttribute(Qt::WA_ShowWithoutActivating);
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

void DragTip::showAt(const QPoint &cursor, const QString &text) {
    if (text != m_text) {
        m_text = text;
        const QSize size = QFontMetrics(tipFont()).size(Qt::TextSingleLine, text);
        setFixedSize(size.grownBy(padding));
        update();
    }
    // At the edge of the screen it goes to the other side: under the cursor it would hide the target.
    QPoint place = cursor + cursorDistance;
    const QRect room = screen()->availableGeometry();
    if (place.x() + width() > room.right())
        place.setX(cursor.x() - cursorDistance.x() - width());
    if (place.y() + height() > room.bottom())
        place.setY(cursor.y() - cursorDistance.y() - height());
    move(place);
    show();
}

void DragTip::paintEvent(QPaintEvent *) {
    QPainter painter(this);
    painter.fillRect(rect(), Theme::accent);
    painter.setFont(tipFont());
    painter.setPen(Theme::dragTipText);
    painter.drawText(rect(), Qt::AlignCenter | Qt::TextSingleLine, m_text);
}
