#include "tables/logtable.h"

#include "http/jsonaccess.h"

namespace emulator {

namespace {

constexpr std::size_t maxEntries = 200000;
constexpr std::int64_t dayMs = 86400000;
constexpr std::int64_t betweenExpiriesMs = 60000;

} // namespace

LogTable::LogTable(Store &store) : m_entries(store, "log", maxEntries) {}

void LogTable::add(std::int64_t at, const char *source, const char *type, const std::string &description,
                   const std::string &user) {
    m_entries.append(at, jsonText({{"created_at", at},
                                   {"source", source},
                                   {"type", type},
                                   {"description", description},
                                   {"user", user}}));
}

void LogTable::expire(std::int64_t nowMs, int days) {
    if (nowMs < m_nextExpiry && days == m_expiryDays)
        return;
    m_nextExpiry = nowMs + betweenExpiriesMs;
    m_expiryDays = days;
    std::unordered_set<std::int64_t> old;
    for (const RecordList::Record &entry : m_entries.all())
        if (entry.at < nowMs - days * dayMs)
            old.insert(entry.row);
    if (!old.empty())
        m_entries.remove(old);
}

std::string LogTable::rangeText(std::int64_t from, std::int64_t to) const {
    std::string text = R"({"items":[)";
    bool first = true;
    for (auto entry = m_entries.all().rbegin(); entry != m_entries.all().rend(); ++entry) {
        if (entry->at >= from && entry->at <= to) {
            text += (first ? "" : ",") + entry->body;
            first = false;
        }
    }
    return text + "]}";
}

} // namespace emulator
