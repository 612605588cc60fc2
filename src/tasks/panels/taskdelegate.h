#pragma once

#include <QStyledItemDelegate>

struct TaskDevice;
struct TaskRecord;

/// Paints the rows of the task panel, all of one height: tasks as cards, and their devices.
class TaskDelegate : public QStyledItemDelegate {
    Q_OBJECT

public:
    static constexpr int rowHeight = 70;

    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter *painter, const QStyleOptionViewItem &option,
               const QModelIndex &index) const override;
    QSize sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const override;

private:
    void paintTask(QPainter *painter, QRect place, const QFont &font, const TaskRecord &task) const;
    void paintSummary(QPainter *painter, QRect place, const QFont &font, const TaskRecord &task) const;
    void paintDevice(QPainter *painter, QRect place, const QFont &font, const TaskDevice &device) const;
};
