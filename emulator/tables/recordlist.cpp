#include "tables/recordlist.h"

#include "tables/store.h"

#include <utility>

namespace emulator {

RecordList::RecordList(Store &store, const std::string &table, std::size_t max)
    : m_store(store),
      m_max(max),
      m_insert(store.database(), ("INSERT INTO " + table + " VALUES(?,?,?)").c_str()),
      m_remove(store.database(), ("DELETE FROM " + table + " WHERE row=?").c_str()),
      m_lastRow(store.lastRow(table)) {
    Statement rows(store.database(), ("SELECT row,at,body FROM " + table + " ORDER BY row").c_str());
    while (rows.step())
        m_records.push_back({rows.integer(0), rows.integer(1), rows.text(2)});
}

void RecordList::append(std::int64_t at, std::string body) {
    m_insert.bind(++m_lastRow).bind(at).bind(body).run();
    m_records.push_back({m_lastRow, at, std::move(body)});
    if (m_records.size() > m_max) {
        m_remove.bind(m_records.front().row).run();
        m_records.pop_front();
    }
}

void RecordList::remove(const std::unordered_set<std::int64_t> &rows) {
    Transaction transaction(m_store.database());
    for (const std::int64_t row : rows)
        m_remove.bind(row).run();
    transaction.commit();
    std::erase_if(m_records, [&](const Record &record) { return rows.contains(record.row); });
}

} // namespace emulator
