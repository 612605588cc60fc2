#include "inventoryreader.h"

#include "messagelog.h"
#include "pagereader.h"
#include "servicesession.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <atomic>

namespace InventoryReader {

namespace {

/// The record as it was, when it says the same: then nothing has to be read, kept or painted anew.
DeviceRecordPtr recordOf(const JSON &value, const DeviceSnapshot &previous) {
    const int index = previous.indexOf(DeviceRecords::identityOf(value));
    if (index >= 0 && previous.at(index)->json == dumpJson(value))
        return previous.at(index);
    return DeviceRecords::parse(value);
}

bool isSame(const DeviceSnapshot &a, const DeviceSnapshot &b) {
    if (a.size() != b.size())
        return false;
    for (int i = 0; i < a.size(); ++i) {
        if (a.at(i) != b.at(i))
            return false;
    }
    return true;
}

DeviceSnapshotPtr readDevices(ServiceSession &session, const DeviceSnapshotPtr &previous) {
    std::vector<DeviceRecordPtr> records;
    int unreadable = 0;
    const unsigned result =
        PageReader::readAll(session, &CApiClient::listDevices, PageReader::recordsOfPage, [&](JSON &page) {
            for (const JSON &value : page) {
                if (DeviceRecordPtr record = recordOf(value, *previous))
                    records.push_back(std::move(record));
                else
                    ++unreadable;
            }
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
    auto snapshot = std::make_shared<const DeviceSnapshot>(std::move(records));
    return isSame(*snapshot, *previous) ? previous : snapshot;
}

struct StatusReading {
    std::vector<DeviceStatusCode> codes;
    DeviceDifference difference = {};
};

/// The states of a snapshot's devices; one that the list misses counts as unauthorized.
std::optional<StatusReading> readCodes(ServiceSession &session, const DeviceSnapshot &snapshot) {
    const auto size = static_cast<std::size_t>(snapshot.size());
    StatusReading reading{std::vector<DeviceStatusCode>(size, DeviceStatusCode::Unauthorized)};
    std::vector<bool> seen(size, false);
    int unreadable = 0;
    int readable = 0;
    const unsigned result = PageReader::readAll(
        session, &CApiClient::listDeviceStatus, PageReader::recordsOfPage, [&](JSON &page) {
            for (const JSON &record : page) {
                std::string id(textMember(record, "id"));
                ++(id.empty() ? unreadable : readable);
                const int index = snapshot.indexOf(id);
                if (index < 0) {
                    if (!id.empty())
                        reading.difference.unknown.push_back(std::move(id));
                    continue;
                }
                const auto place = static_cast<std::size_t>(index);
                seen[place] = true;
                reading.codes[place] = DeviceStatus::codeOf(textMember(record, "connect_status"),
                                                            textMember(record, "auth_status"),
                                                            textMember(record, "action_status"));
            }
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
            reading.difference.stateless.push_back(snapshot.at(static_cast<int>(i))->id.toStdString());
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

std::optional<Sites::List> readSites(ServiceSession &session) {
    JSON all = JSON::array();
    const unsigned result =
        PageReader::readAll(session, &CApiClient::listSites, PageReader::recordsOfPage, [&](JSON &page) {
            for (JSON &site : page)
                all.push_back(std::move(site));
        });
    if (result != ApiOk) {
        qDebug("HTTP API(listSites) failed!");
        return std::nullopt;
    }
    if (all.empty())
        qDebug("no site found!");
    logSites(all);
    Sites::List sites = Sites::parse(all);
    const auto isReadable = [](const JSON &site) { return !textMember(site, "siteid").empty(); };
    if (all.empty() || std::any_of(all.begin(), all.end(), isReadable))
        return sites;
    qWarning("none of %d site records has an id", static_cast<int>(all.size()));
    return std::nullopt;
}

Reading readAll(ServiceSession &session, const DeviceSnapshotPtr &previous,
                std::vector<DeviceStatusCode> previousCodes) {
    const MessageLog::PollScope counted;
    Reading reading;
    reading.sites = readSites(session);
    reading.devices = readDevices(session, previous);
    if (!reading.devices)
        return reading;
    if (std::optional<StatusReading> status = readCodes(session, *reading.devices))
        reading.codes = std::move(status->codes);
    else
        reading.codes = carriedOver(*reading.devices, *previous, previousCodes);
    return reading;
}

std::optional<DeviceStatusUpdate> readStatus(ServiceSession &session, const DeviceSnapshotPtr &snapshot,
                                             const std::vector<DeviceStatusCode> &codes) {
    std::optional<StatusReading> reading = readCodes(session, *snapshot);
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
