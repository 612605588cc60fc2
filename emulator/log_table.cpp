#include "log_table.h"

#include "json_access.h"

namespace emulator {

namespace {

constexpr std::size_t mostEntries = 20000;

} // namespace

LogTable::LogTable(Store &store) : m_entries(store, "log", mostEntries) {}

void LogTable::add(std::int64_t at, const char *source, const char *type, const std::string &description,
                   const std::string &user) {
    m_entries.append(at, jsonText({{"created_at", at},
                                   {"source", source},
                                   {"type", type},
                                   {"description", description},
                                   {"user", user}}));
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
