#include "devices/inventory/inventoryupdater.h"

#include "api/session/servicerequest.h"
#include "tasks/service/taskinfopool.h"

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
        [this](JobOutcome end) { onEnded(end); });
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
        m_knowledge = LoadState::Read;
        m_settled = m_difference;
    } else if (m_knowledge == LoadState::None) {
        m_knowledge = LoadState::Failed;
    }
    emit read(reading);
}

void InventoryUpdater::onEnded(JobOutcome end) {
    m_reloading = false;
    m_sinceReading.start();
    if (end != JobOutcome::Delivered && end != JobOutcome::SessionGone) {
        if (m_knowledge == LoadState::None)
            m_knowledge = LoadState::Failed;
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
        [this](JobOutcome end) {
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                qDebug("HTTP API(listDeviceStatus) failed! (%d)", static_cast<int>(ApiException));
            emit statesSettled();
        },
        [] { std::this_thread::sleep_for(settlingTime); });
}

void InventoryUpdater::stop() {
    m_reloadWanted = false;
    m_readingMs = 0;
    m_knowledge = LoadState::None;
    m_difference = {};
    m_settled = {};
}
