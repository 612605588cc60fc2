#pragma once

#include "devices/inventory/devicerecord.h"
#include "devices/inventory/devicestatus.h"

#include <QHash>
#include <QStringList>

#include <memory>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

/// The devices of one reading, with their indexes. Built once on any thread, never changed after that.
class DeviceSnapshot {
public:
    DeviceSnapshot() = default;
    /// Of records with the same id the last one counts.
    explicit DeviceSnapshot(std::vector<DeviceRecordPtr> records);

    int size() const { return static_cast<int>(m_records.size()); }
    const DeviceRecordPtr &at(int index) const { return m_records[static_cast<std::size_t>(index)]; }

    /// The place of a device, or -1.
    int indexOf(const QString &id) const;
    int indexOf(const std::string &id) const;

    /// The present records of those devices that are still managed.
    std::vector<DeviceRecordPtr> presentOf(const QStringList &ids) const;

    /// How many devices are in a site; all of them for the overview.
    int siteCount(const QString &siteId) const;

private:
    std::vector<DeviceRecordPtr> m_records;
    std::unordered_map<std::string, int> m_byId;
    QHash<QString, int> m_siteCounts;
};

using DeviceSnapshotPtr = std::shared_ptr<const DeviceSnapshot>;

/// Between the states of a poll and a snapshot: a sign that the devices have changed. Both lists are sorted.
struct DeviceDifference {
    std::vector<std::string> unknown = {};   ///< ids that have a state and are not in the snapshot
    std::vector<std::string> stateless = {}; ///< ids of the snapshot without a state

    bool operator==(const DeviceDifference &) const = default;
};

/// What a poll found: the states that differ, for the snapshot that it was compared with.
struct DeviceStatusUpdate {
    DeviceSnapshotPtr snapshot;
    std::vector<std::pair<int, DeviceStatusCode>> changes; ///< place in the snapshot, new code
    DeviceDifference difference = {};
};

/// The devices that the console shows and their states. User-interface thread.
class DeviceInventory {
public:
    DeviceInventory() : m_snapshot(std::make_shared<DeviceSnapshot>()) {}

    /// Takes over a new reading with the state of each of its devices, in the same order.
    void replace(DeviceSnapshotPtr snapshot, std::vector<DeviceStatusCode> codes);

    /// Takes over the states of a poll. False, with nothing changed, when the poll was of an older reading.
    bool apply(const DeviceStatusUpdate &update);

    const DeviceSnapshotPtr &snapshot() const { return m_snapshot; }
    const DeviceRecord &record(int index) const { return *m_snapshot->at(index); }
    DeviceStatusCode status(int index) const { return m_codes[static_cast<std::size_t>(index)]; }
    const std::vector<DeviceStatusCode> &statuses() const { return m_codes; }

private:
    DeviceSnapshotPtr m_snapshot;
    std::vector<DeviceStatusCode> m_codes;
};
