#pragma once

#include <QStyledItemDelegate>

/// Paints the cells of a table's row: the check mark where the cell has one, the picture whose name is the
/// cell's decoration, and the text. A click on a cell with a mark turns it, and so does the space bar in its
/// row.
class RowDelegate : public QStyledItemDelegate {
    Q_OBJECT

public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter *painter, const QStyleOptionViewItem &given, const QModelIndex &index) const override;

protected:
    bool editorEvent(QEvent *event, QAbstractItemModel *model, const QStyleOptionViewItem &option,
                     const QModelIndex &index) override;
};
