#include "devices/inventory/deviceinventory.h"

#include "devices/sites/sitelist.h"

DeviceSnapshot::DeviceSnapshot(std::vector<DeviceRecordPtr> records) {
    m_records.reserve(records.size());
    m_byId.reserve(records.size());
    for (DeviceRecordPtr &record : records) {
        const auto [place, isNew] = m_byId.try_emplace(record->id.toStdString(), size());
        if (isNew)
            m_records.push_back(std::move(record));
        else
            m_records[static_cast<std::size_t>(place->second)] = std::move(record);
    }
    for (const DeviceRecordPtr &record : m_records) {
        for (const QString &site : record->siteIds)
            ++m_siteCounts[site];
    }
}

int DeviceSnapshot::indexOf(const QString &id) const {
    return indexOf(id.toStdString());
}

int DeviceSnapshot::indexOf(const std::string &id) const {
    const auto found = m_byId.find(id);
    return found == m_byId.end() ? -1 : found->second;
}

std::vector<DeviceRecordPtr> DeviceSnapshot::presentOf(const QStringList &ids) const {
    std::vector<DeviceRecordPtr> present;
    for (const QString &id : ids) {
        if (const int place = indexOf(id); place >= 0)
            present.push_back(at(place));
    }
    return present;
}

int DeviceSnapshot::siteCount(const QString &siteId) const {
    return siteId == Sites::overviewId ? size() : m_siteCounts.value(siteId);
}

void DeviceInventory::replace(DeviceSnapshotPtr snapshot, std::vector<DeviceStatusCode> codes) {
    codes.resize(static_cast<std::size_t>(snapshot->size()), DeviceStatusCode::Unauthorized);
    m_snapshot = std::move(snapshot);
    m_codes = std::move(codes);
}

bool DeviceInventory::apply(const DeviceStatusUpdate &update) {
    if (update.snapshot != m_snapshot)
        return false;
    for (const auto &[index, code] : update.changes)
        m_codes[static_cast<std::size_t>(index)] = code;
    return true;
}
