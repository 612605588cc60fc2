#pragma once

#include "tables/recordlist.h"

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

    /// Forgets what is older than so many days; cheap to ask for again and again.
    void expire(std::int64_t nowMs, int days);

    /// The entries from a time to another, both included, newest first, as they travel.
    std::string rangeText(std::int64_t from, std::int64_t to) const;

private:
    RecordList m_entries;
    std::int64_t m_nextExpiry = 0;
    int m_expiryDays = 0; ///< that the last expiry went by
};

} // namespace emulator
