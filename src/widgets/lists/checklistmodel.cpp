#include "widgets/lists/checklistmodel.h"

#include <algorithm>
#include <numeric>

void CheckListModel::setItemCount(int count, bool checked) {
    for (int item = count; item < itemCount(); ++item)
        check(item, false);
    m_checkedCount += checked ? std::max(count - itemCount(), 0) : 0;
    m_checked.resize(static_cast<std::size_t>(count), checked);
    arrange();
}

void CheckListModel::updateCells() {
    if (!m_order.empty())
        emit dataChanged(index(0, 0), index(rowCount() - 1, columnCount() - 1));
}

void CheckListModel::setSearch(const QString &text) {
    m_search = text;
    arrange();
}

void CheckListModel::check(int item, bool checked) {
    const auto place = static_cast<std::size_t>(item);
    if (m_checked[place] != checked)
        m_checkedCount += checked ? 1 : -1;
    m_checked[place] = checked;
}

void CheckListModel::setChecked(const std::vector<int> &items, bool checked) {
    for (const int item : items)
        check(item, checked);
    updateCells();
    emit changed();
}

void CheckListModel::setShownChecked(bool checked) {
    setChecked(m_order, checked);
}

Qt::CheckState CheckListModel::shownState() const {
    const auto checked =
        std::count_if(m_order.begin(), m_order.end(), [this](int item) { return isChecked(item); });
    if (checked == 0)
        return Qt::Unchecked;
    return static_cast<std::size_t>(checked) == m_order.size() ? Qt::Checked : Qt::PartiallyChecked;
}

int CheckListModel::rowCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : static_cast<int>(m_order.size());
}

QVariant CheckListModel::data(const QModelIndex &index, int role) const {
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    if (role == Qt::DisplayRole)
        return text(itemAt(index.row()), index.column());
    if (role == Qt::CheckStateRole && index.column() == 0)
        return isChecked(itemAt(index.row())) ? Qt::Checked : Qt::Unchecked;
    return {};
}

bool CheckListModel::setData(const QModelIndex &index, const QVariant &value, int role) {
    if (role != Qt::CheckStateRole || index.column() != 0)
        return false;
    check(itemAt(index.row()), value.toInt() == Qt::Checked);
    emit dataChanged(index, index, {role});
    emit changed();
    return true;
}

Qt::ItemFlags CheckListModel::flags(const QModelIndex &index) const {
    const Qt::ItemFlags checkable = index.column() == 0 ? Qt::ItemIsUserCheckable : Qt::NoItemFlags;
    return QAbstractTableModel::flags(index) | checkable;
}

void CheckListModel::sort(int column, Qt::SortOrder order) {
    if (column >= columnCount())
        return;
    m_sortColumn = column;
    m_sortOrder = order;
    emit layoutAboutToBeChanged();
    const std::vector<int> before = m_order;
    sortItems(m_order);
    std::vector<int> rows(m_checked.size());
    for (std::size_t row = 0; row < m_order.size(); ++row)
        rows[static_cast<std::size_t>(m_order[row])] = static_cast<int>(row);
    for (const QModelIndex &old : persistentIndexList()) {
        const int item = before[static_cast<std::size_t>(old.row())];
        changePersistentIndex(old, index(rows[static_cast<std::size_t>(item)], old.column()));
    }
    emit layoutChanged();
}

void CheckListModel::arrange() {
    beginResetModel();
    m_order = find(m_search);
    sortItems(m_order);
    endResetModel();
    emit changed();
}

std::vector<int> CheckListModel::sortedItems() const {
    std::vector<int> items(m_checked.size());
    std::iota(items.begin(), items.end(), 0);
    sortItems(items);
    return items;
}

/// Equal ones keep the order in which they came.
void CheckListModel::sortItems(std::vector<int> &items) const {
    if (m_sortColumn < 0)
        return;
    const bool ascending = m_sortOrder == Qt::AscendingOrder;
    std::sort(items.begin(), items.end(), [&](int left, int right) {
        const int difference = compare(left, right, m_sortColumn, ascending);
        return difference != 0 ? difference < 0 : left < right;
    });
}
