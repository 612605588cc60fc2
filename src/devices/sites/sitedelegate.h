#pragma once

#include <QStyledItemDelegate>

#include <functional>

class QTreeWidget;

/// Paints the rows of the site tree: captions, the mark of the selected row, and the count at a row's end.
/// Hands edited names over.
class SiteDelegate : public QStyledItemDelegate {
    Q_OBJECT

public:
    using Edited = std::function<void(const QString &siteId, const QString &name)>;

    SiteDelegate(QTreeWidget *tree, Edited edited);

    QSize sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const override;
    QWidget *createEditor(QWidget *parent, const QStyleOptionViewItem &option,
                          const QModelIndex &index) const override;
    void updateEditorGeometry(QWidget *editor, const QStyleOptionViewItem &option,
                              const QModelIndex &index) const override;
    void setModelData(QWidget *editor, QAbstractItemModel *model, const QModelIndex &index) const override;
    void paint(QPainter *painter, const QStyleOptionViewItem &option,
               const QModelIndex &index) const override;
    bool eventFilter(QObject *editor, QEvent *event) override;

private:
    void paintSite(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const;
    void paintCaption(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const;
    void paintRowState(QPainter *painter, const QStyleOptionViewItem &option, const QRect &row) const;

    QTreeWidget *m_tree;
    Edited m_edited;
};
