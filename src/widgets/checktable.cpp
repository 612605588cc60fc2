#include "checktable.h"

#include "checklistmodel.h"
#include "icons.h"
#include "rowpainter.h"
#include "theme.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QPainter>
#include <QStyledItemDelegate>

namespace {

constexpr int padding = 8;
constexpr int markSize = 16;
constexpr int markColumn = 0;

class RowDelegate : public QStyledItemDelegate {
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter *painter, const QStyleOptionViewItem &given,
               const QModelIndex &index) const override {
        QStyleOptionViewItem option(given);
        // The selected row shows where the keys go; a frame about one cell would promise an editor.
        option.state.setFlag(QStyle::State_HasFocus, false);
        RowPainter::paintBackground(painter, option);
        QRect place = option.rect.adjusted(padding, 0, -padding, 0);
        if (index.column() == markColumn) {
            paintMark(painter, place, isChecked(index));
            place.setLeft(place.left() + markSize + 2 * padding);
        }
        const QString text = index.data().toString();
        RowPainter::paintText(painter, place, option.font, colourOf(index, text), text);
    }

protected:
    bool editorEvent(QEvent *event, QAbstractItemModel *model, const QStyleOptionViewItem &,
                     const QModelIndex &index) override {
        const bool isClick = event->type() == QEvent::MouseButtonRelease && index.column() == markColumn &&
                             static_cast<QMouseEvent *>(event)->button() == Qt::LeftButton;
        const bool isSpace =
            event->type() == QEvent::KeyPress && static_cast<QKeyEvent *>(event)->key() == Qt::Key_Space;
        if (!isClick && !isSpace)
            return false;
        const QModelIndex mark = index.siblingAtColumn(markColumn);
        return model->setData(mark, isChecked(mark) ? Qt::Unchecked : Qt::Checked, Qt::CheckStateRole);
    }

private:
    static QColor colourOf(const QModelIndex &index, const QString &text) {
        const QVariant given = index.data(Qt::ForegroundRole);
        if (given.isValid())
            return given.value<QColor>();
        return text == QLatin1String("--") ? Theme::textQuiet : Theme::textStrong;
    }

    static bool isChecked(const QModelIndex &index) {
        return index.data(Qt::CheckStateRole).toInt() == Qt::Checked;
    }

    static void paintMark(QPainter *painter, const QRect &place, bool checked) {
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
};

} // namespace

CheckTable::CheckTable(QWidget *parent) : QTableView(parent) {
    setItemDelegate(new RowDelegate(this));
    setSelectionBehavior(QAbstractItemView::SelectRows);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setShowGrid(false);
    setWordWrap(false);
    setTabKeyNavigation(false);
    verticalHeader()->hide();
    verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    verticalHeader()->setDefaultSectionSize(Theme::rowHeight);
    horizontalHeader()->setHighlightSections(false);
    horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    horizontalHeader()->setStretchLastSection(true);
    horizontalHeader()->setFixedHeight(34);
}

void CheckTable::showList(CheckListModel *model, std::initializer_list<int> widths, int sortColumn) {
    setModel(model);
    int column = 0;
    for (const int width : widths)
        setColumnWidth(column++, width);
    for (; column < model->columnCount(); ++column)
        horizontalHeader()->setSectionResizeMode(column, QHeaderView::Stretch);
    horizontalHeader()->setSortIndicator(sortColumn, Qt::AscendingOrder);
    setSortingEnabled(true);
}
