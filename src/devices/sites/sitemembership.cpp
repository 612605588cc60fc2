#include "devices/sites/sitemembership.h"

#include "devices/inventory/devicerecord.h"
#include "devices/sites/sitelist.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace SiteMembership {

namespace {

constexpr const char *siteMember = "siteid";

JSON parsed(std::string_view text) {
    try {
        return parseJson(text);
    } catch (const std::exception &) {
        return nullptr;
    }
}

bool holds(const JSON &ids, const std::string &id) {
    return std::find(ids.begin(), ids.end(), JSON(id)) != ids.end();
}

void leave(JSON &ids, const std::string &id) {
    ids.erase(std::remove(ids.begin(), ids.end(), JSON(id)), ids.end());
}

/// A record without any site is one that the service is asked to forget.
void keepManaged(JSON &ids) {
    if (ids.empty())
        ids.push_back(Sites::overviewId.toStdString());
}

/// Makes a change in the sites of every record and collects the records that it changes.
template <typename Change>
std::vector<DeviceOutcome> changeSites(const JSON &records, JSON &changed, const Change &change) {
    std::vector<DeviceOutcome> outcomes;
    outcomes.reserve(records.size());
    changed = JSON::array();
    for (const JSON &each : records) {
        const QString deviceId = DeviceRecords::identityOf(each);
        JSON ids = siteIdsOf(each);
        const Outcome outcome = change(deviceId, ids);
        outcomes.push_back({deviceId, outcome});
        if (outcome == Outcome::Unchanged)
            continue;
        JSON record = each;
        record[siteMember] = std::move(ids);
        changed.push_back(std::move(record));
    }
    return outcomes;
}

} // namespace

JSON siteIdsOf(const JSON &record) {
    const auto found = record.find(siteMember);
    if (found == record.end())
        return JSON::array();
    JSON ids = found->is_string() ? parsed(found->get_ref<const std::string &>()) : *found;
    if (!ids.is_array())
        return JSON::array();
    ids.erase(std::remove_if(ids.begin(), ids.end(), [](const JSON &id) { return !id.is_string(); }),
              ids.end());
    return ids;
}

QByteArray encode(const DraggedDevices &devices) {
    JSON ids = JSON::array();
    for (const QString &id : devices.deviceIds)
        ids.push_back(id.toStdString());
    return QByteArray::fromStdString(
        dumpJson({{"source", devices.sourceSiteId.toStdString()}, {"devices", std::move(ids)}}));
}

std::optional<DraggedDevices> decode(const QByteArray &data) {
    const JSON value = parsed({data.constData(), static_cast<std::size_t>(data.size())});
    DraggedDevices devices{stringMember(value, "source"), {}};
    const auto ids = value.is_object() ? value.find("devices") : value.end();
    if (ids == value.end() || !ids->is_array() || devices.sourceSiteId.isEmpty())
        return std::nullopt;
    for (const JSON &id : *ids) {
        if (id.is_string() && !id.get_ref<const std::string &>().empty())
            devices.deviceIds.append(QString::fromStdString(id.get_ref<const std::string &>()));
    }
    return devices.deviceIds.isEmpty() ? std::nullopt : std::optional(std::move(devices));
}

std::vector<DeviceOutcome> assign(const JSON &records, const Drop &drop, JSON &changed) {
    qDebug("onDeviceDrop! site id: %s", qUtf8Printable(drop.targetSiteId));
    qDebug("device selected: %d", static_cast<int>(records.size()));
    const std::string target = drop.targetSiteId.toStdString();
    const std::string source = drop.sourceSiteId.toStdString();
    const bool leaves = drop.isMove && source != target && drop.sourceSiteId != Sites::overviewId;
    return changeSites(records, changed, [&](const QString &deviceId, JSON &ids) {
        const bool left = leaves && holds(ids, source);
        const std::string before = dumpJson(ids);
        if (left)
            leave(ids, source);
        if (holds(ids, target)) {
            qDebug("site id: %s already exists. just ignore", target.c_str());
            return left ? Outcome::Moved : Outcome::Unchanged;
        }
        qDebug("site id is not found! add it to device!");
        ids.push_back(target);
        qDebug("device id: %s, all site id: %s, add site id: %s, final site id dump: %s",
               qUtf8Printable(deviceId), before.c_str(), target.c_str(), dumpJson(ids).c_str());
        return left ? Outcome::Moved : Outcome::Added;
    });
}

std::vector<DeviceOutcome> removeFromSite(const JSON &records, const QString &siteId, JSON &changed) {
    const std::string site = siteId.toStdString();
    return changeSites(records, changed, [&](const QString &deviceId, JSON &ids) {
        if (siteId == Sites::overviewId || !holds(ids, site))
            return Outcome::Unchanged;
        const std::string before = dumpJson(ids);
        leave(ids, site);
        keepManaged(ids);
        qDebug("device id: %s, all site id: %s, remote site id: %s, final site id dump: %s",
               qUtf8Printable(deviceId), before.c_str(), site.c_str(), dumpJson(ids).c_str());
        return Outcome::Removed;
    });
}

} // namespace SiteMembership
