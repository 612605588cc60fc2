#pragma once

#include <QStyledItemDelegate>

/// Paints cells whose decoration is the name of a picture: the picture, then the text.
class NoteDelegate : public QStyledItemDelegate {
    Q_OBJECT

public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter *painter, const QStyleOptionViewItem &given, const QModelIndex &index) const override;
};
