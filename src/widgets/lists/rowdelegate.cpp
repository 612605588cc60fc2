#include "widgets/lists/rowdelegate.h"

#include "widgets/lists/rowpainter.h"
#include "widgets/style/icons.h"
#include "widgets/style/theme.h"

#include <QKeyEvent>
#include <QPainter>

namespace {

constexpr int padding = 8;
constexpr int markSize = 16;
constexpr int iconSize = 14;
constexpr int markColumn = 0;

QColor colourOf(const QModelIndex &index, const QString &text) {
    const QVariant given = index.data(Qt::ForegroundRole);
    if (given.isValid())
        return given.value<QColor>();
    return text == QLatin1String("--") ? Theme::textQuiet : Theme::textStrong;
}

bool isChecked(const QModelIndex &index) {
    return index.data(Qt::CheckStateRole).toInt() == Qt::Checked;
}

void paintMark(QPainter *painter, const QRect &place, bool checked) {
    const QRect mark(place.left(), place.center().y() - markSize / 2, markSize, markSize);
    painter->save();
    painter->setRenderHint(QPainter::Antialiasing);
    painter->setPen(checked ? Theme::accent : Theme::textDim);
    painter->setBrush(checked ? QBrush(Theme::accent) : QBrush());
    painter->drawRoundedRect(QRectF(mark).adjusted(0.5, 0.5, -0.5, -0.5), 3, 3);
    painter->restore();
    if (checked)
        painter->drawPixmap(mark, Icons::pixmap(QStringLiteral(":/images/icon_general_check_solid.svg"),
                                                mark.size(), painter->device()->devicePixelRatioF()));
}

} // namespace

void RowDelegate::paint(QPainter *painter, const QStyleOptionViewItem &given,
                        const QModelIndex &index) const {
    QStyleOptionViewItem option(given);
    // The selected row shows where the keys go; a frame about one cell would promise an editor.
    option.state.setFlag(QStyle::State_HasFocus, false);
    RowPainter::paintBackground(painter, option);
    QRect place = option.rect.adjusted(padding, 0, -padding, 0);
    if (index.data(Qt::CheckStateRole).isValid()) {
        paintMark(painter, place, isChecked(index));
        place.setLeft(place.left() + markSize + 2 * padding);
    }
    const QString picture = index.data(Qt::DecorationRole).toString();
    if (!picture.isEmpty()) {
        const QRect icon(place.left(), place.center().y() - iconSize / 2, iconSize, iconSize);
        painter->drawPixmap(icon,
                            Icons::pixmap(picture, icon.size(), painter->device()->devicePixelRatioF()));
        place.setLeft(icon.right() + padding);
    }
    const QString text = index.data().toString();
    RowPainter::paintText(painter, place, option.font, colourOf(index, text), text);
}

bool RowDelegate::editorEvent(QEvent *event, QAbstractItemModel *model, const QStyleOptionViewItem &,
                              const QModelIndex &index) {
    const bool isClick = event->type() == QEvent::MouseButtonRelease && index.column() == markColumn &&
                         static_cast<QMouseEvent *>(event)->button() == Qt::LeftButton;
    const bool isSpace =
        event->type() == QEvent::KeyPress && static_cast<QKeyEvent *>(event)->key() == Qt::Key_Space;
    if (!isClick && !isSpace)
        return false;
    const QModelIndex mark = index.siblingAtColumn(markColumn);
    return model->setData(mark, isChecked(mark) ? Qt::Unchecked : Qt::Checked, Qt::CheckStateRole);
}
