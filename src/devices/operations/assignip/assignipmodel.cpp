#include "devices/operations/assignip/assignipmodel.h"

#include "devices/inventory/devicesearch.h"

#include <algorithm>

namespace {
constexpr DeviceColumn deviceColumns[] = {DeviceColumn::Model, DeviceColumn::Mac, DeviceColumn::Ip};
} // namespace

AssignIpModel::AssignIpModel(OperationTargets::List targets, const DeviceSnapshot &managed, QObject *parent)
    : CheckListModel(parent),
      m_targets(std::move(targets)),
      m_assignment(m_targets, managed),
      m_notes(m_targets.size()) {
    setItemCount(static_cast<int>(m_targets.size()), true);
}

std::vector<int> AssignIpModel::checkedItems() const {
    std::vector<int> items = sortedItems();
    std::erase_if(items, [this](int item) { return !isChecked(item); });
    return items;
}

void AssignIpModel::setAutomatic(bool automatic) {
    m_automatic = automatic;
    updateCells();
}

void AssignIpModel::showAddresses(const std::vector<TargetWarning> &warnings) {
    std::fill(m_notes.begin(), m_notes.end(), QString());
    for (const TargetWarning &warning : warnings) {
        for (const int item : warning.targets)
            m_notes[static_cast<std::size_t>(item)] = warning.note;
    }
    updateCells();
}

int AssignIpModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : columnTotal;
}

QVariant AssignIpModel::data(const QModelIndex &index, int role) const {
    if (role == Qt::EditRole && index.column() == NewColumn) {
        const quint32 address = m_assignment.address(itemAt(index.row()));
        return address == 0 ? QString() : AddressPattern::textOf(address);
    }
    return CheckListModel::data(index, role);
}

/// An empty text gives the address back to those who are handed one.
bool AssignIpModel::setData(const QModelIndex &index, const QVariant &value, int role) {
    if (role != Qt::EditRole || index.column() != NewColumn)
        return CheckListModel::setData(index, value, role);
    const QString typed = value.toString().trimmed();
    if (typed == data(index, Qt::EditRole).toString())
        return false;
    if (!typed.isEmpty() && !AddressPattern::isAddress(typed)) {
        emit addressRefused(typed);
        return false;
    }
    m_assignment.setTyped(itemAt(index.row()), typed.isEmpty() ? 0 : AddressPattern::numberOf(typed));
    emit addressTyped();
    return true;
}

QVariant AssignIpModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 || section >= columnTotal)
        return {};
    const QString titles[] = {tr("Model"), tr("MAC"), tr("Current IP"), tr("New IP"), tr("Note")};
    return titles[section];
}

Qt::ItemFlags AssignIpModel::flags(const QModelIndex &index) const {
    const bool editable = index.column() == NewColumn && !m_automatic;
    return CheckListModel::flags(index) | (editable ? Qt::ItemIsEditable : Qt::NoItemFlags);
}

QString AssignIpModel::text(int item, int column) const {
    const auto place = static_cast<std::size_t>(item);
    if (column == NoteColumn)
        return m_notes[place];
    if (column != NewColumn)
        return m_targets[place].device->text(deviceColumns[column]);
    if (m_automatic)
        return tr("Automatic");
    const quint32 address = m_assignment.address(item);
    return address == 0 ? QStringLiteral("--") : AddressPattern::textOf(address);
}

std::vector<int> AssignIpModel::find(const QString &search) const {
    const DeviceSearch words(search, {});
    std::vector<int> found;
    for (std::size_t i = 0; i < m_targets.size(); ++i) {
        if (words.matches(*m_targets[i].device))
            found.push_back(static_cast<int>(i));
    }
    return found;
}

int AssignIpModel::compare(int left, int right, int column, bool ascending) const {
    if (column <= CurrentColumn)
        return DeviceRecords::compare(*m_targets[static_cast<std::size_t>(left)].device,
                                      *m_targets[static_cast<std::size_t>(right)].device,
                                      deviceColumns[column], ascending);
    int difference = 0;
    if (column == NewColumn) {
        const quint32 a = m_assignment.address(left);
        const quint32 b = m_assignment.address(right);
        difference = a < b ? -1 : a > b ? 1 : 0;
    } else {
        difference = text(left, column).compare(text(right, column));
    }
    return ascending ? difference : -difference;
}
