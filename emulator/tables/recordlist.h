#pragma once

#include "tables/database.h"

#include <cstdint>
#include <deque>
#include <string>
#include <unordered_set>

namespace emulator {

class Store;

/// Records that come one after the other and are forgotten, the oldest first, beyond a limit. They are kept
/// in a table of the store with the columns row, at and body.
class RecordList {
public:
    struct Record {
        std::int64_t row = 0;
        std::int64_t at = 0; ///< Unix ms
        std::string body;    ///< JSON text
    };

    RecordList(Store &store, const std::string &table, std::size_t max);

    /// The row of the next record, which no record has or had.
    std::int64_t nextRow() const { return m_lastRow + 1; }
    void append(std::int64_t at, std::string body);
    void remove(const std::unordered_set<std::int64_t> &rows);

    /// Oldest first.
    const std::deque<Record> &all() const { return m_records; }

private:
    Store &m_store;
    std::size_t m_max;
    Statement m_insert;
    Statement m_remove;
    std::deque<Record> m_records;
    std::int64_t m_lastRow;
};

} // namespace emulator
