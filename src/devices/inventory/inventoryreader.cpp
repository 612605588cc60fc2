#include "devices/inventory/inventoryreader.h"

#include "api/session/pagereader.h"
#include "api/session/servicesession.h"
#include "devices/inventory/recordpool.h"
#include "platform/log/messagelog.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <atomic>

namespace InventoryReader {

namespace {

/// Takes the records of a list over from the reading before where their texts are the same: then nothing has
/// to be parsed, kept or painted anew.
class RecordReader {
public:
    explicit RecordReader(const DeviceSnapshot &previous) : m_previous(previous) {}

    /// Null for a record without an identity.
    DeviceRecordPtr read(std::string_view text) {
        // The service mostly keeps its order.
        if (isSame(m_next, text))
            return m_previous.at(m_next++);
        DeviceRecordPtr record = DeviceRecords::parse(text, m_pool);
        const int index = record ? m_previous.indexOf(record->id) : -1;
        if (index < 0)
            return record;
        m_next = index + 1;
        return isSame(index, text) ? m_previous.at(index) : record;
    }

private:
    bool isSame(int index, std::string_view text) const {
        return index < m_previous.size() && m_previous.at(index)->textHash == DeviceRecords::hashOf(text);
    }

    const DeviceSnapshot &m_previous;
    RecordPool m_pool;
    int m_next = 0;
};

bool isSame(const std::vector<DeviceRecordPtr> &records, const DeviceSnapshot &previous) {
    if (records.size() != static_cast<std::size_t>(previous.size()))
        return false;
    for (int i = 0; i < previous.size(); ++i) {
        if (records[static_cast<std::size_t>(i)] != previous.at(i))
            return false;
    }
    return true;
}

struct StatusReading {
    std::vector<DeviceStatusCode> codes;
    DeviceDifference difference = {};
};

/// What a status record says; nothing where it has no id.
std::optional<StatusCache::Entry> readState(std::string_view text, const DeviceSnapshot &snapshot,
                                            DeviceDifference &difference) {
    const JSON record = parseJson(text);
    std::string id(textMember(record, "id"));
    if (id.empty())
        return std::nullopt;
    const int index = snapshot.indexOf(id);
    if (index < 0)
        difference.unknown.push_back(std::move(id));
    return StatusCache::Entry{0, index,
                              DeviceStatus::codeOf(textMember(record, "connect_status"),
                                                   textMember(record, "auth_status"),
                                                   textMember(record, "action_status"))};
}

/// The states of a snapshot's devices; one that the list misses counts as unauthorized.
std::optional<StatusReading> readCodes(ServiceSession &session, const DeviceSnapshotPtr &snapshot,
                                       StatusCache &cache) {
    const auto size = static_cast<std::size_t>(snapshot->size());
    StatusReading reading{std::vector<DeviceStatusCode>(size, DeviceStatusCode::Unauthorized)};
    std::vector<bool> seen(size, false);
    int unreadable = 0;
    int readable = 0;
    std::size_t record = 0;
    cache.follow(snapshot);
    const unsigned result =
        PageReader::readTexts(session, &CApiClient::listDeviceStatusText, [&](std::string_view text) {
            StatusCache::Entry &entry = cache.at(record++);
            const std::size_t hash = DeviceRecords::hashOf(text);
            if (entry.hash != hash || entry.index < 0) {
                const auto read = readState(text, *snapshot, reading.difference);
                entry = read.value_or(StatusCache::Entry());
                entry.hash = hash;
                ++(read ? readable : unreadable);
            } else {
                ++readable;
            }
            if (entry.index < 0)
                return;
            const auto device = static_cast<std::size_t>(entry.index);
            seen[device] = true;
            reading.codes[device] = entry.code;
        });
    if (result != ApiOk) {
        qDebug("HTTP API(listDeviceStatus) failed! (%d)", static_cast<int>(result));
        return std::nullopt;
    }
    if (unreadable > 0)
        qWarning("%d states have no device id and were left out", unreadable);
    if (unreadable > 0 && readable == 0)
        return std::nullopt;
    for (std::size_t i = 0; i < size; ++i) {
        if (!seen[i])
            reading.difference.stateless.push_back(snapshot->at(static_cast<int>(i))->id.toStdString());
    }
    for (std::vector<std::string> *ids : {&reading.difference.unknown, &reading.difference.stateless})
        std::sort(ids->begin(), ids->end());
    return reading;
}

/// The states to show while the new ones could not be read: as before, for the devices that stayed.
std::vector<DeviceStatusCode> carriedOver(const DeviceSnapshot &snapshot, const DeviceSnapshot &previous,
                                          const std::vector<DeviceStatusCode> &previousCodes) {
    std::vector<DeviceStatusCode> codes(static_cast<std::size_t>(snapshot.size()),
                                        DeviceStatusCode::Unauthorized);
    for (int i = 0; i < snapshot.size(); ++i) {
        const auto before = static_cast<std::size_t>(previous.indexOf(snapshot.at(i)->id));
        if (before < previousCodes.size())
            codes[static_cast<std::size_t>(i)] = previousCodes[before];
    }
    return codes;
}

/// Only a list that differs from the last one is worth its room in the log.
void logSites(const JSON &sites) {
    static std::atomic<std::size_t> logged = 0;
    const std::string dump = dumpJson(sites);
    const std::size_t hash = std::hash<std::string>()(dump);
    if (logged.exchange(hash) != hash)
        qDebug("site list size: %d, dump: %s", static_cast<int>(sites.size()), dump.c_str());
}

} // namespace

DeviceSnapshotPtr readDevices(ServiceSession &session, const DeviceSnapshotPtr &previous) {
    std::vector<DeviceRecordPtr> records;
    RecordReader reader(*previous);
    int unreadable = 0;
    const unsigned result =
        PageReader::readTexts(session, &CApiClient::listDevicesText, [&](std::string_view text) {
            if (DeviceRecordPtr record = reader.read(text))
                records.push_back(std::move(record));
            else
                ++unreadable;
        });
    if (result != ApiOk) {
        qDebug("HTTP API(listDevices) failed!");
        return nullptr;
    }
    if (unreadable > 0)
        qWarning("%d device records have neither id nor MAC address and are not shown", unreadable);
    // Nothing but garbage is no list, and certainly no empty one.
    if (unreadable > 0 && records.empty())
        return nullptr;
    return isSame(records, *previous) ? previous : std::make_shared<const DeviceSnapshot>(std::move(records));
}

unsigned readSites(ServiceSession &session, Sites::List &sites) {
    JSON all = JSON::array();
    const unsigned result =
        PageReader::readAll(session, &CApiClient::listSites, PageReader::recordsOfPage, [&](JSON &page) {
            for (JSON &site : page)
                all.push_back(std::move(site));
        });
    if (result != ApiOk) {
        qDebug("HTTP API(listSites) failed!");
        return result;
    }
    if (all.empty())
        qDebug("no site found!");
    logSites(all);
    sites = Sites::parse(all);
    const auto isReadable = [](const JSON &site) { return !textMember(site, "siteid").empty(); };
    if (all.empty() || std::any_of(all.begin(), all.end(), isReadable))
        return ApiOk;
    qWarning("none of %d site records has an id", static_cast<int>(all.size()));
    return ApiMissingData;
}

Reading readAll(ServiceSession &session, const DeviceSnapshotPtr &previous,
                std::vector<DeviceStatusCode> previousCodes) {
    const MessageLog::PollScope counted;
    Reading reading;
    if (Sites::List sites; readSites(session, sites) == ApiOk)
        reading.sites = std::move(sites);
    reading.devices = readDevices(session, previous);
    if (!reading.devices)
        return reading;
    StatusCache cache;
    if (std::optional<StatusReading> status = readCodes(session, reading.devices, cache))
        reading.codes = std::move(status->codes);
    else
        reading.codes = carriedOver(*reading.devices, *previous, previousCodes);
    return reading;
}

std::optional<DeviceStatusUpdate> readStatus(ServiceSession &session, const DeviceSnapshotPtr &snapshot,
                                             const std::vector<DeviceStatusCode> &codes, StatusCache *cache) {
    StatusCache own;
    std::optional<StatusReading> reading = readCodes(session, snapshot, cache ? *cache : own);
    if (!reading)
        return std::nullopt;
    DeviceStatusUpdate update{snapshot, {}, std::move(reading->difference)};
    for (std::size_t i = 0; i < reading->codes.size() && i < codes.size(); ++i) {
        if (reading->codes[i] != codes[i])
            update.changes.emplace_back(static_cast<int>(i), reading->codes[i]);
    }
    return update;
}

} // namespace InventoryReader
