#include "tables/batches.h"

#include "http/response.h"

#include <iterator>
#include <utility>

namespace emulator {

std::optional<Json> Batches::take(const std::string &owner, const std::string &stage, Json records,
                                  std::int64_t nowMs) {
    if (stage == "all")
        return records;
    if (stage == "start") {
        m_open[owner] = {nowMs, std::move(records)};
        return std::nullopt;
    }
    dropOverdue(nowMs);
    const auto batch = m_open.find(owner);
    if ((stage != "update" && stage != "end") || batch == m_open.end())
        throw Refusal(Code::Malformed, "the stage continues no open batch");
    auto &held = batch->second.records.get_ref<Json::array_t &>();
    auto &added = records.get_ref<Json::array_t &>();
    held.insert(held.end(), std::make_move_iterator(added.begin()), std::make_move_iterator(added.end()));
    if (stage == "update")
        return std::nullopt;
    Json complete = std::move(batch->second.records);
    m_open.erase(batch);
    return complete;
}

void Batches::dropOverdue(std::int64_t nowMs) {
    std::erase_if(m_open, [&](const auto &entry) { return nowMs - entry.second.openedAt >= m_timeoutMs; });
}

} // namespace emulator
