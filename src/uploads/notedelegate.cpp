#include "notedelegate.h"

#include "icons.h"
#include "rowpainter.h"
#include "theme.h"

#include <QPainter>

namespace {
constexpr int padding = 8;
constexpr int iconSize = 14;
} // namespace

void NoteDelegate::paint(QPainter *painter, const QStyleOptionViewItem &given,
                         const QModelIndex &index) const {
    QStyleOptionViewItem option(given);
    // The selected row shows where the keys go.
    option.state.setFlag(QStyle::State_HasFocus, false);
    RowPainter::paintBackground(painter, option);
    QRect place = option.rect.adjusted(padding, 0, -padding, 0);
    const QString picture = index.data(Qt::DecorationRole).toString();
    if (!picture.isEmpty()) {
        const QRect icon(place.left(), place.center().y() - iconSize / 2, iconSize, iconSize);
        painter->drawPixmap(icon,
                            Icons::pixmap(picture, icon.size(), painter->device()->devicePixelRatioF()));
        place.setLeft(icon.right() + padding);
    }
    const QString text = index.data().toString();
    RowPainter::paintText(painter, place, option.font,
                          text == QLatin1String("--") ? Theme::textQuiet : Theme::textStrong, text);
}
