#pragma once

#include "record_list.h"

#include <cstdint>
#include <string>

namespace emulator {

/// What has happened, in the order in which it did.
class LogTable {
public:
    explicit LogTable(Store &store);

    /// The source is "Device" or "System", the type "Alarm", "Event" or "Audit"; the user is empty for what
    /// no account did.
    void add(std::int64_t at, const char *source, const char *type, const std::string &description,
             const std::string &user);

    /// The entries from a time to another, both included, newest first, as they travel.
    std::string rangeText(std::int64_t from, std::int64_t to) const;

private:
    RecordList m_entries;
};

} // namespace emulator
