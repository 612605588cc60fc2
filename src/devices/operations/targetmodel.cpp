#include "devices/operations/targetmodel.h"

#include "devices/inventory/devicesearch.h"

namespace {

constexpr DeviceColumn deviceColumns[] = {DeviceColumn::Model, DeviceColumn::Ip, DeviceColumn::Mac};
constexpr int noteColumn = std::size(deviceColumns);

} // namespace

void TargetModel::setTargets(OperationTargets::List targets) {
    m_targets.clear();
    setItemCount(0, false);
    m_targets = std::move(targets);
    m_notes.assign(m_targets.size(), {});
    setItemCount(static_cast<int>(m_targets.size()), true);
}

std::vector<int> TargetModel::checkedItems() const {
    std::vector<int> items;
    for (int item = 0; item < itemCount(); ++item) {
        if (isChecked(item))
            items.push_back(item);
    }
    return items;
}

QStringList TargetModel::checkedIds() const {
    QStringList ids;
    for (const int item : checkedItems())
        ids += target(item).device->id;
    return ids;
}

void TargetModel::setWarnings(const std::vector<TargetWarning> &warnings) {
    std::fill(m_notes.begin(), m_notes.end(), QString());
    for (const TargetWarning &warning : warnings) {
        for (const int item : warning.targets) {
            QString &note = m_notes[static_cast<std::size_t>(item)];
            note = note.isEmpty() ? warning.note : tr("%1, %2").arg(note, warning.note);
        }
    }
    updateCells();
}

int TargetModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : noteColumn + 1;
}

QVariant TargetModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 || section > noteColumn)
        return {};
    return section == noteColumn ? tr("Note") : DeviceRecords::columnTitle(deviceColumns[section]);
}

QString TargetModel::text(int item, int column) const {
    return column == noteColumn ? m_notes[static_cast<std::size_t>(item)]
                                : target(item).device->text(deviceColumns[column]);
}

std::vector<int> TargetModel::find(const QString &search) const {
    const DeviceSearch words(search, {});
    std::vector<int> found;
    for (int item = 0; item < static_cast<int>(m_targets.size()); ++item) {
        if (words.matches(*target(item).device))
            found.push_back(item);
    }
    return found;
}

/// Devices with a note come first.
int TargetModel::compare(int left, int right, int column, bool ascending) const {
    if (column != noteColumn)
        return DeviceRecords::compare(*target(left).device, *target(right).device, deviceColumns[column],
                                      ascending);
    const QString &a = m_notes[static_cast<std::size_t>(left)];
    const QString &b = m_notes[static_cast<std::size_t>(right)];
    if (a.isEmpty() != b.isEmpty())
        return b.isEmpty() ? -1 : 1;
    return ascending ? a.compare(b) : b.compare(a);
}
