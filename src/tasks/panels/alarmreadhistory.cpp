#include "tasks/panels/alarmreadhistory.h"

#include "store/clientstore.h"
#include "store/storewriter.h"

#include <nlohmann/json.hpp>

#include <algorithm>

namespace {

constexpr int maxServices = 16;

/// The service's own entry, at the end of the list: the services used last stay.
void takeOut(JSON &services, const std::string &service) {
    const auto found = std::find_if(services.begin(), services.end(),
                                    [&](const JSON &each) { return textMember(each, "service") == service; });
    if (found != services.end())
        services.erase(found);
}

JSON storedServices() {
    JSON services = JSON::parse(CClientStore::instance().alarmReadHistory().toStdString(), nullptr, false);
    return services.is_array() ? services : JSON::array();
}

void write(const QString &service, const QSet<QString> &read, bool olderRead) {
    JSON services = storedServices();
    takeOut(services, service.toStdString());
    JSON ids = JSON::array();
    for (const QString &id : read)
        ids.push_back(id.toStdString());
    services.push_back({{"service", service.toStdString()}, {"read", std::move(ids)}, {"older", olderRead}});
    while (services.size() > maxServices)
        services.erase(services.begin());
    if (!CClientStore::instance().setAlarmReadHistory(QString::fromStdString(dumpJson(services))))
        qWarning("The alarms that were read could not be stored");
}

} // namespace

void AlarmReadHistory::open(const QString &service) {
    StoreWriter::flush();
    m_service = service;
    m_read.clear();
    m_olderRead = false;
    for (const JSON &each : storedServices()) {
        if (stringMember(each, "service") != service)
            continue;
        m_olderRead = each.contains("older") && each.at("older") == true;
        if (each.contains("read")) {
            for (const JSON &id : each.at("read"))
                m_read.insert(id.is_string() ? QString::fromStdString(id.get<std::string>()) : QString());
        }
    }
}

void AlarmReadHistory::markAllRead(const AlarmList &alarms) {
    const qsizetype before = m_read.size();
    for (const AlarmRecord &alarm : alarms)
        m_read.insert(alarm.alid);
    const bool olderWereRead = std::exchange(m_olderRead, true);
    if (m_read.size() != before || !olderWereRead)
        save();
}

void AlarmReadHistory::keepOnly(const AlarmList &alarms) {
    QSet<QString> present;
    for (const AlarmRecord &alarm : alarms) {
        if (m_read.contains(alarm.alid))
            present.insert(alarm.alid);
    }
    if (present.size() == m_read.size())
        return;
    m_read = std::move(present);
    save();
}

int AlarmReadHistory::unreadCount(const AlarmList &alarms, int total) const {
    const auto listed = static_cast<int>(alarms.size());
    const auto read = std::count_if(alarms.begin(), alarms.end(),
                                    [this](const AlarmRecord &alarm) { return isRead(alarm); });
    const int older = std::max(0, total - listed);
    return listed - static_cast<int>(read) + (m_olderRead ? 0 : older);
}

void AlarmReadHistory::save() {
    StoreWriter::post(
        [service = m_service, read = m_read, olderRead = m_olderRead] { write(service, read, olderRead); });
}
