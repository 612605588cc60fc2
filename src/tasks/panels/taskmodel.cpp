#include "tasks/panels/taskmodel.h"

#include "tasks/panels/tasktexts.h"
#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"
#include "widgets/lists/rowdiff.h"
#include "widgets/style/plaintext.h"

namespace {

/// The line above the devices.
constexpr int summaryRows = 1;

std::vector<QString> deviceKeys(const TaskRecord &task, const std::vector<int> &order) {
    std::vector<QString> keys;
    for (const int place : order)
        keys.push_back(QString::number(place) + task.devices[static_cast<std::size_t>(place)].target->id);
    return keys;
}

} // namespace

TaskModel::~TaskModel() = default;

void TaskModel::setTasks(const std::vector<TaskRecordPtr> &tasks) {
    const auto same = [](const TaskRecordPtr &task, const std::unique_ptr<Node> &node) {
        return task->tid == node->task->tid;
    };
    if (!std::equal(tasks.begin(), tasks.end(), m_nodes.begin(), m_nodes.end(), same)) {
        std::vector<QString> before;
        std::vector<QString> after;
        for (const auto &node : m_nodes)
            before.push_back(node->task->tid);
        for (const TaskRecordPtr &task : tasks)
            after.push_back(task->tid);
        const RowDiff diff = RowDiff::between(before, after);
        for (const RowDiff::Range &range : diff.removed)
            removeNodes(range.first, range.last);
        for (const RowDiff::Range &range : diff.inserted)
            insertNodes(range.first, range.last, tasks);
    }
    takeChanges(tasks);
}

void TaskModel::removeNodes(int first, int last) {
    beginRemoveRows({}, first, last);
    m_nodes.erase(m_nodes.begin() + first, m_nodes.begin() + last + 1);
    numberFrom(static_cast<std::size_t>(first));
    endRemoveRows();
}

void TaskModel::insertNodes(int first, int last, const std::vector<TaskRecordPtr> &tasks) {
    beginInsertRows({}, first, last);
    std::vector<std::unique_ptr<Node>> added;
    for (int row = first; row <= last; ++row) {
        added.push_back(std::make_unique<Node>());
        added.back()->task = tasks[static_cast<std::size_t>(row)];
    }
    m_nodes.insert(m_nodes.begin() + first, std::make_move_iterator(added.begin()),
                   std::make_move_iterator(added.end()));
    numberFrom(static_cast<std::size_t>(first));
    endInsertRows();
}

void TaskModel::numberFrom(std::size_t row) {
    for (; row < m_nodes.size(); ++row)
        m_nodes[row]->row = static_cast<int>(row);
}

void TaskModel::takeChanges(const std::vector<TaskRecordPtr> &tasks) {
    for (std::size_t row = 0; row < tasks.size(); ++row) {
        Node &node = *m_nodes[row];
        if (node.task == tasks[row])
            continue;
        if (node.opened && tasks[row]->devices.empty()) {
            // The line that sums devices up goes with them, and that is no change of order any more.
            removeNodes(static_cast<int>(row), static_cast<int>(row));
            insertNodes(static_cast<int>(row), static_cast<int>(row), tasks);
            continue;
        }
        if (node.opened)
            changeDevices(node, tasks[row]);
        else
            node.task = tasks[row];
        emit dataChanged(indexOf(node), indexOf(node));
    }
}

/// Failed devices move up; the others are where they were.
void TaskModel::changeDevices(Node &node, const TaskRecordPtr &task) {
    const std::vector<int> order = TaskTexts::order(*task);
    const RowDiff diff = RowDiff::between(deviceKeys(*node.task, node.order), deviceKeys(*task, order));
    const QModelIndex parent = indexOf(node);
    for (const RowDiff::Range &range : diff.removed) {
        beginRemoveRows(parent, range.first + summaryRows, range.last + summaryRows);
        node.order.erase(node.order.begin() + range.first, node.order.begin() + range.last + 1);
        endRemoveRows();
    }
    // The rows that stay have the same places in both records.
    node.task = task;
    for (const RowDiff::Range &range : diff.inserted) {
        beginInsertRows(parent, range.first + summaryRows, range.last + summaryRows);
        node.order.insert(node.order.begin() + range.first, order.begin() + range.first,
                          order.begin() + range.last + 1);
        endInsertRows();
    }
    emit dataChanged(index(0, 0, parent), index(rowCount(parent) - 1, 0, parent));
}

TaskModel::Node *TaskModel::nodeOf(const QModelIndex &index) const {
    if (auto *node = static_cast<Node *>(index.internalPointer()))
        return node;
    return m_nodes[static_cast<std::size_t>(index.row())].get();
}

TaskModel::RowKind TaskModel::kindOf(const QModelIndex &index) const {
    if (!index.internalPointer())
        return RowKind::Task;
    return index.row() < summaryRows ? RowKind::Summary : RowKind::Device;
}

TaskRecordPtr TaskModel::taskOf(const QModelIndex &index) const {
    return index.isValid() ? nodeOf(index)->task : nullptr;
}

const TaskDevice &TaskModel::deviceOf(const QModelIndex &index) const {
    const Node *node = nodeOf(index);
    const int place = node->order[static_cast<std::size_t>(index.row() - summaryRows)];
    return node->task->devices[static_cast<std::size_t>(place)];
}

QModelIndex TaskModel::index(int row, int column, const QModelIndex &parent) const {
    if (!hasIndex(row, column, parent))
        return {};
    if (!parent.isValid())
        return createIndex(row, column, nullptr);
    Node *node = nodeOf(parent);
    open(*node);
    return createIndex(row, column, node);
}

QModelIndex TaskModel::parent(const QModelIndex &index) const {
    const auto *node = static_cast<const Node *>(index.internalPointer());
    return node ? indexOf(*node) : QModelIndex();
}

int TaskModel::rowCount(const QModelIndex &parent) const {
    if (!parent.isValid())
        return static_cast<int>(m_nodes.size());
    if (!hasChildren(parent))
        return 0;
    const Node *node = nodeOf(parent);
    // While rows come and go, the order is ahead of the task, or behind it.
    const std::size_t devices = node->opened ? node->order.size() : node->task->devices.size();
    return static_cast<int>(devices) + summaryRows;
}

int TaskModel::columnCount(const QModelIndex &) const {
    return 1;
}

bool TaskModel::hasChildren(const QModelIndex &parent) const {
    if (!parent.isValid())
        return true;
    return kindOf(parent) == RowKind::Task && !nodeOf(parent)->task->devices.empty();
}

/// From now on its rows are known outside, and changes of them have to be told.
void TaskModel::open(Node &node) {
    if (node.opened)
        return;
    node.order = TaskTexts::order(*node.task);
    node.opened = true;
}

QVariant TaskModel::data(const QModelIndex &index, int role) const {
    if (!index.isValid())
        return {};
    const TaskRecordPtr task = taskOf(index);
    switch (kindOf(index)) {
    case RowKind::Task:
        return taskData(*task, role);
    case RowKind::Summary:
        return role == Qt::DisplayRole ? QVariant(TaskTexts::summary(*task)) : QVariant();
    case RowKind::Device:
        break;
    }
    return deviceData(deviceOf(index), role);
}

QVariant TaskModel::taskData(const TaskRecord &task, int role) const {
    switch (role) {
    case Qt::DisplayRole:
        return TaskType::title(task.type);
    case Qt::ToolTipRole:
        return PlainText::toolTip(
            QStringList{TaskType::title(task.type), TaskState::text(task.state), TaskTexts::origin(task)}
                .join(QLatin1Char('\n')));
    case Qt::AccessibleTextRole:
        return TaskTexts::spoken(
            {TaskType::title(task.type), TaskTexts::standing(task),
             TaskTexts::showsProgress(task) ? TaskTexts::percent(task.progress) : QString(), task.user,
             TaskTexts::shortTime(task.createdAt)});
    default:
        return {};
    }
}

QVariant TaskModel::deviceData(const TaskDevice &device, int role) const {
    switch (role) {
    case Qt::DisplayRole:
        return TaskTexts::target(*device.target);
    case Qt::ToolTipRole:
        return PlainText::toolTip(TaskTexts::target(*device.target) + QLatin1Char('\n') +
                                  TaskState::text(device.state));
    case Qt::AccessibleTextRole:
        return TaskTexts::spoken(
            {TaskTexts::target(*device.target), TaskState::text(device.state),
             TaskState::isFinal(device.state) ? QString() : TaskTexts::percent(device.progress)});
    default:
        return {};
    }
}
