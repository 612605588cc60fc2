#pragma once

#include "devices/inventory/deviceinventory.h"

#include <vector>

/// What the status records of the last poll said, by their places in the list: most say the same in the next
/// one. For one reading at a time.
class StatusCache {
public:
    struct Entry {
        std::size_t hash = 0; ///< of the record's text
        int index = -1;       ///< of the device in the snapshot; -1 where the record is of none
        DeviceStatusCode code = DeviceStatusCode::Unauthorized;
    };

    /// Forgets everything unless it was of this snapshot.
    void follow(const DeviceSnapshotPtr &snapshot) {
        if (snapshot != m_snapshot)
            m_entries.clear();
        m_snapshot = snapshot;
    }

    /// The entry of a record, new ones at the end. The reference holds until the next call.
    Entry &at(std::size_t record) {
        if (record >= m_entries.size())
            m_entries.resize(record + 1);
        return m_entries[record];
    }

private:
    DeviceSnapshotPtr m_snapshot;
    std::vector<Entry> m_entries;
};
