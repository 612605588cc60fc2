#include "devices/sites/devicecommit.h"

#include "api/session/pagereader.h"
#include "api/session/servicesession.h"
#include "devices/inventory/devicerecord.h"

#include <QDebug>
#include <QHash>
#include <QSet>

#include <nlohmann/json.hpp>

namespace DeviceCommit {

namespace {

constexpr std::size_t batchSize = 500;

unsigned sendStage(ServiceSession &session, const JSON &records, const char *stage) {
    return session.call([&](CApiClient &client) { return client.commitDevices(records, stage); });
}

/// A batch that is not ended leaves everything as it was, so the first failure ends it.
unsigned sendBatches(ServiceSession &session, const JSON &records) {
    for (std::size_t first = 0; first < records.size(); first += batchSize) {
        const std::size_t last = std::min(first + batchSize, records.size());
        JSON batch = JSON::array();
        for (std::size_t i = first; i < last; ++i)
            batch.push_back(records[i]);
        const char *stage = first == 0 ? "start" : last == records.size() ? "end" : "update";
        const unsigned result = sendStage(session, batch, stage);
        if (result != ApiOk)
            return result;
    }
    return ApiOk;
}

} // namespace

unsigned readPresent(ServiceSession &session, const QStringList &deviceIds, JSON &records) {
    const QSet<QString> wanted(deviceIds.begin(), deviceIds.end());
    QHash<QString, JSON> found;
    const unsigned result = PageReader::readAll(
        session, &CApiClient::listDevices, PageReader::recordsOfPage,
        [&](JSON &page) {
            for (JSON &record : page) {
                const QString id = DeviceRecords::identityOf(record);
                if (wanted.contains(id))
                    found[id] = std::move(record);
            }
        },
        [&] { return found.size() < wanted.size(); });
    records = JSON::array();
    for (const QString &id : deviceIds) {
        if (found.contains(id))
            records.push_back(found.take(id));
    }
    if (result != ApiOk)
        qWarning("HTTP API(listDevices) failed!");
    return result;
}

unsigned send(ServiceSession &session, const JSON &records) {
    if (records.empty())
        return ApiOk;
    const unsigned result =
        records.size() <= batchSize ? sendStage(session, records, "all") : sendBatches(session, records);
    if (result == ApiOk)
        qDebug("commit device info: %s", dumpJson(records).c_str());
    else
        qWarning("HTTP API(commitDevices) failed!");
    return result;
}

} // namespace DeviceCommit
