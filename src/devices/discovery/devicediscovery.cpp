#include "devices/discovery/devicediscovery.h"

#include "api/client/apilog.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>

struct DeviceDiscovery::Running {
    Search search;
    QElapsedTimer sinceStart;
};

namespace {

constexpr int beatMs = 200;

struct Found {
    unsigned result = ApiOk;
    std::vector<DeviceRecordPtr> devices;
};

unsigned startOnService(ServiceSession &session, const DeviceDiscovery::Search &search) {
    constexpr int seconds = DeviceDiscovery::scanSeconds;
    const QByteArray from = search.from.toUtf8();
    const QByteArray to = search.to.toUtf8();
    switch (search.method) {
    case DeviceDiscovery::Method::Address:
        return ApiLog::logged("deviceDiscoverByIP", session.call([&](CApiClient &client) {
            return client.deviceDiscoverByIP(from, seconds);
        }));
    case DeviceDiscovery::Method::Range:
        return ApiLog::logged("deviceDiscoverByIPs", session.call([&](CApiClient &client) {
            return client.deviceDiscoverByIPs(from, to, seconds);
        }));
    case DeviceDiscovery::Method::Network:
        break;
    }
    const unsigned result = session.call([&](CApiClient &client) {
        qDebug("On discovering ...");
        return client.deviceDiscovery(seconds);
    });
    if (result != ApiOk)
        qDebug("http api(deviceDiscovery) failed!");
    return result;
}

Found readFound(ServiceSession &session, DeviceDiscovery::Method method) {
    JSON records;
    Found found;
    found.result = session.call([&](CApiClient &client) { return client.discoveredDevices(records); });
    if (found.result == ApiOk && !records.is_array())
        found.result = ApiMissingData;
    if (ApiLog::logged("discoveredDevices", found.result) != ApiOk)
        return found;
    const int count = static_cast<int>(records.size());
    if (method == DeviceDiscovery::Method::Network)
        qDebug("Found jNewDevices(%d): %s", count, dumpJson(records).c_str());
    else
        qDebug("Found devices(%d): %s", count, dumpJson(records).c_str());
    for (const JSON &record : records) {
        if (DeviceRecordPtr device = DeviceRecords::parse(record))
            found.devices.push_back(std::move(device));
    }
    return found;
}

} // namespace

DeviceDiscovery::DeviceDiscovery(QObject *parent) : QObject(parent) {
    m_beat.setInterval(beatMs);
    connect(&m_beat, &QTimer::timeout, this, &DeviceDiscovery::progressed);
}

DeviceDiscovery::~DeviceDiscovery() = default;

int DeviceDiscovery::passedSeconds() const {
    if (m_running.empty() || !m_running.back()->sinceStart.isValid())
        return 0;
    return static_cast<int>(std::min<qint64>(scanSeconds, m_running.back()->sinceStart.elapsed() / 1000));
}

void DeviceDiscovery::start(const Search &search) {
    const auto isNetwork = [](const RunningPtr &running) {
        return running->search.method == Method::Network;
    };
    const bool together =
        search.method == Method::Network && std::all_of(m_running.begin(), m_running.end(), isNetwork);
    if (m_running.empty() || together)
        begin(search);
    else
        m_waiting.push_back(search);
}

void DeviceDiscovery::begin(const Search &search) {
    const RunningPtr running = std::make_shared<Running>();
    running->search = search;
    m_running.push_back(running);
    m_beat.start();
    if (search.method == Method::Network) {
        // The five seconds count from the click, however long the call takes.
        running->sinceStart.start();
        QTimer::singleShot(scanSeconds * 1000, this, [this, running] { refreshDiscoveredDevices(running); });
    }
    startScan(running);
    emit progressed();
}

void DeviceDiscovery::startScan(const RunningPtr &running) {
    request(
        this, "discovering devices",
        [search = running->search](ServiceSession &session) { return startOnService(session, search); },
        [this, running](unsigned result) {
            onScanStarted(running, result == ApiOk ? QString() : apiResultText(result));
        },
        [this, running](const QString &reason) { onScanStarted(running, reason); });
}

void DeviceDiscovery::onScanStarted(const RunningPtr &running, const QString &error) {
    if (!error.isEmpty()) {
        // A search of the network is read nevertheless, but nobody has to wait for that.
        emit failed(error);
        return end(running);
    }
    if (running->search.method == Method::Network)
        return;
    running->sinceStart.start();
    QTimer::singleShot(scanSeconds * 1000, this, [this, running] { refreshDiscoveredDevices(running); });
}

void DeviceDiscovery::refreshDiscoveredDevices(const RunningPtr &running) {
    const auto fail = [this, running](const QString &reason) {
        end(running);
        emit failed(reason);
    };
    request(
        this, "reading discovered devices",
        [method = running->search.method](ServiceSession &session) { return readFound(session, method); },
        [this, running, fail](const Found &result) {
            if (result.result != ApiOk)
                return fail(apiResultText(result.result));
            end(running);
            emit found(running->search, result.devices);
        },
        fail);
}

void DeviceDiscovery::end(const RunningPtr &running) {
    std::erase(m_running, running);
    if (m_running.empty() && !m_waiting.empty()) {
        const Search next = m_waiting.front();
        m_waiting.pop_front();
        begin(next);
    }
    if (m_running.empty())
        m_beat.stop();
    emit progressed();
}
