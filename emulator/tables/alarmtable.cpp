#include "tables/alarmtable.h"

#include "http/response.h"
#include "tables/logtable.h"
#include "tables/records.h"
#include "tables/store.h"

#include <algorithm>
#include <unordered_map>

namespace emulator {

namespace {

constexpr std::size_t maxAlarms = 5000;
constexpr auto serverName = "Device Manager service";

std::string idOf(std::int64_t row) {
    return "AL" + std::to_string(row);
}

std::string nameOf(const Device *device) {
    return device ? displayName(*device) : serverName;
}

} // namespace

std::string displayName(const Device &device) {
    const Json record = Json::parse(device.body);
    const auto host = record.find("d_hostname");
    const bool hasHost =
        host != record.end() && host->is_string() && !host->get_ref<const std::string &>().empty();
    return hasHost ? host->get<std::string>() : device.ip;
}

std::string descriptionOf(AlarmKind kind, const std::string &name) {
    switch (kind) {
    case AlarmKind::ServerStarted:
        return "Server started";
    case AlarmKind::LostConnection:
        return "Lost connection to " + name;
    case AlarmKind::ConnectionRestored:
        return "Connection to " + name + " restored";
    case AlarmKind::CardError:
        return "Memory card error on " + name;
    case AlarmKind::ServerStopped:
        return "Server stopped";
    case AlarmKind::AuthorizationLost:
        return "Lost authorization of " + name;
    }
    return {};
}

AlarmTable::AlarmTable(Store &store, LogTable &log)
    : m_alarms(store, "alarm", maxAlarms), m_store(store), m_log(log) {}

void AlarmTable::raise(AlarmKind kind, const Device *device, std::int64_t nowMs) {
    const std::string name = nameOf(device);
    Transaction transaction(m_store.database());
    add(kind, device, name, nowMs);
    m_log.add(nowMs, device ? "Device" : "System", "Alarm", descriptionOf(kind, name), {});
    transaction.commit();
}

void AlarmTable::add(AlarmKind kind, const Device *device, std::int64_t at) {
    add(kind, device, nameOf(device), at);
}

void AlarmTable::add(AlarmKind kind, const Device *device, const std::string &name, std::int64_t at) {
    m_alarms.append(at, jsonText({{"alid", idOf(m_alarms.nextRow())},
                                  {"despid", static_cast<int>(kind)},
                                  {"actinfo", name},
                                  {"initm", std::to_string(at)},
                                  {"deviceid", device ? device->id : std::string()},
                                  {"d_ip", device ? device->ip : std::string()}}));
}

void AlarmTable::remove(const std::vector<std::string> &ids) {
    std::unordered_map<std::string, std::int64_t> rows;
    for (const RecordList::Record &alarm : m_alarms.all())
        rows.emplace(idOf(alarm.row), alarm.row);
    std::unordered_set<std::int64_t> wanted;
    for (const std::string &id : ids) {
        const auto found = rows.find(id);
        if (found == rows.end())
            throw Refusal(Code::UnknownId, "no alarm " + id);
        wanted.insert(found->second);
    }
    m_alarms.remove(wanted);
}

std::string AlarmTable::pageText(Page page) const {
    const auto &all = m_alarms.all();
    const std::size_t first = std::min(page.start, all.size());
    const std::size_t last = first + std::min(page.count, all.size() - first);
    std::string text = R"({"items":[)";
    for (std::size_t i = first; i < last; ++i)
        text += (i == first ? "" : ",") + all[all.size() - 1 - i].body;
    return text + R"(],"total_items":)" + std::to_string(all.size()) + '}';
}

} // namespace emulator
