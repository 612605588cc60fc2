#include "inventoryupdater.h"

#include "servicerequest.h"
#include "taskinfopool.h"

#include <QDebug>

#include <chrono>
#include <new>
#include <thread>

namespace {

constexpr std::chrono::milliseconds settlingTime{2000};
/// A reading waits so many times as long as the last one took, so that readings are a small share of the
/// service's and the client's work whatever the size of the fleet.
constexpr int restAfterReading = 10;
/// While tasks move, devices change more than else.
constexpr int restWhileTasksMove = 3;

} // namespace

InventoryUpdater::InventoryUpdater(const DeviceInventory &inventory, std::function<int()> siteCommits,
                                   QObject *parent)
    : QObject(parent),
      m_inventory(inventory),
      m_siteCommits(std::move(siteCommits)),
      m_netTask(new (std::nothrow) NetTask(NetTask::Turn::Reading)) {
    if (!m_netTask)
        qDebug("net task create failed!should not be this case!");
}

InventoryUpdater::~InventoryUpdater() = default;

void InventoryUpdater::reload() {
    if (!CLocalStore::instance().loginInfo().isComplete())
        return;
    if (m_reloading) {
        m_reloadWanted = true;
        return;
    }
    const auto work = [snapshot = m_inventory.snapshot(),
                       codes = m_inventory.statuses()](ServiceSession &session) {
        QElapsedTimer timer;
        timer.start();
        InventoryReader::Reading reading = InventoryReader::readAll(session, snapshot, codes);
        return std::pair(std::move(reading), timer.elapsed());
    };
    m_reloadWanted = false;
    m_reloading = ServiceRequest::post(
        m_netTask.get(), this, work,
        [this, commits = m_siteCommits()](const std::pair<InventoryReader::Reading, qint64> &timed) {
            m_readingMs = timed.second;
            take(timed.first, commits);
        },
        [this](JobEnd end) { onEnded(end); });
    // The runner may still be busy with the last answer of a session that has ended.
    m_reloadWanted = !m_reloading;
}

void InventoryUpdater::reloadFor(const DeviceDifference &difference) {
    m_difference = difference;
    if (difference == DeviceDifference())
        m_settled = {};
    else if (difference != m_settled)
        reload();
}

void InventoryUpdater::take(InventoryReader::Reading reading, int siteCommits) {
    // Sites that were read before a commit are older than the tree.
    if (siteCommits != m_siteCommits())
        reading.sites.reset();
    if (reading.devices) {
        m_knowledge = Knowledge::Read;
        m_settled = m_difference;
    } else if (m_knowledge == Knowledge::None) {
        m_knowledge = Knowledge::Failed;
    }
    emit read(reading);
}

void InventoryUpdater::onEnded(JobEnd end) {
    m_reloading = false;
    m_sinceReading.start();
    if (end != JobEnd::Delivered && end != JobEnd::SessionGone) {
        if (m_knowledge == Knowledge::None)
            m_knowledge = Knowledge::Failed;
        emit failed();
    }
    if (m_reloadWanted)
        reload();
}

void InventoryUpdater::reloadForTasks() {
    CTaskInfoPool &pool = CTaskInfoPool::instance();
    if (!pool.isTasksChanged() || !hasRested(restWhileTasksMove))
        return;
    reload();
    pool.clearTasksChanged();
}

void InventoryUpdater::reloadAfterRest() {
    if (hasRested(restAfterReading))
        reload();
}

/// Whether the last reading has ended so many times as long ago as it took.
bool InventoryUpdater::hasRested(int times) const {
    return !m_reloading && (!m_sinceReading.isValid() || m_sinceReading.elapsed() >= m_readingMs * times);
}

void InventoryUpdater::readStatesSoon() {
    const auto work = [snapshot = m_inventory.snapshot(),
                       codes = m_inventory.statuses()](ServiceSession &session) {
        return InventoryReader::readStatus(session, snapshot, codes);
    };
    ServiceRequest::post(
        NetJob::createRunner("reading the states after a removal", NetTask::Turn::Reading), this, work,
        [this](const std::optional<DeviceStatusUpdate> &update) {
            if (update)
                emit statesRead(*update);
        },
        [this](JobEnd end) {
            if (end == JobEnd::NotRun || end == JobEnd::Failed)
                qDebug("HTTP API(listDeviceStatus) failed! (%d)", static_cast<int>(ApiException));
            emit statesSettled();
        },
        [] { std::this_thread::sleep_for(settlingTime); });
}

void InventoryUpdater::stop() {
    m_reloadWanted = false;
    m_readingMs = 0;
    m_knowledge = Knowledge::None;
    m_difference = {};
    m_settled = {};
}
