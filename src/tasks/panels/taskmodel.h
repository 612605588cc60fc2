#pragma once

#include "tasks/service/taskrecord.h"

#include <QAbstractItemModel>

#include <memory>

/// Tasks, and below each a line that sums it up and its devices, which are put in order when they are looked
/// at.
///
/// Bringing a new list in changes only the rows that differ, so that selection, open rows and scroll position
/// of the views stay.
class TaskModel : public QAbstractItemModel {
    Q_OBJECT

public:
    enum class RowKind { Task, Summary, Device };

    using QAbstractItemModel::QAbstractItemModel;
    ~TaskModel() override;

    void setTasks(const std::vector<TaskRecordPtr> &tasks);

    RowKind kindOf(const QModelIndex &index) const;
    /// The task of a row, or of the row that it stands below.
    TaskRecordPtr taskOf(const QModelIndex &index) const;
    /// The device of a row of that kind.
    const TaskDevice &deviceOf(const QModelIndex &index) const;

    QModelIndex index(int row, int column, const QModelIndex &parent = {}) const override;
    QModelIndex parent(const QModelIndex &index) const override;
    int rowCount(const QModelIndex &parent = {}) const override;
    int columnCount(const QModelIndex &parent = {}) const override;
    bool hasChildren(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;

private:
    /// A task with its row, which its opened rows refer to: their own rows' numbers would not survive a
    /// change.
    struct Node {
        TaskRecordPtr task;
        int row = 0;
        bool opened = false;    ///< somebody has seen its devices
        std::vector<int> order; ///< of the devices, once opened
    };

    Node *nodeOf(const QModelIndex &index) const;
    static void open(Node &node);
    QModelIndex indexOf(const Node &node) const { return createIndex(node.row, 0, nullptr); }
    void removeNodes(int first, int last);
    void insertNodes(int first, int last, const std::vector<TaskRecordPtr> &tasks);
    void numberFrom(std::size_t row);
    void takeChanges(const std::vector<TaskRecordPtr> &tasks);
    void changeDevices(Node &node, const TaskRecordPtr &task);
    QVariant taskData(const TaskRecord &task, int role) const;
    QVariant deviceData(const TaskDevice &device, int role) const;

    std::vector<std::unique_ptr<Node>> m_nodes;
};
