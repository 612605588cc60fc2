#pragma once

#include "api/session/netjob.h"
#include "devices/inventory/inventoryreader.h"

#include <QElapsedTimer>
#include <QObject>

#include <functional>

/// Reads the inventory of the present session again when that is due: one reading at a time, another one
/// right after it where it was asked for meanwhile. User-interface thread.
class InventoryUpdater : public QObject {
    Q_OBJECT

public:
    /// What is known of the service's devices.
    enum class LoadState { None, Failed, Read };

    /// The inventory must outlive the updater. siteCommits: counts the commits of sites.
    InventoryUpdater(const DeviceInventory &inventory, std::function<int()> siteCommits,
                     QObject *parent = nullptr);
    ~InventoryUpdater() override;

    LoadState knowledge() const { return m_knowledge; }

    void reload();
    /// A poll has found this difference, or none. One that a reading has not settled is the service's way:
    /// reading again for it would go on without end.
    void reloadFor(const DeviceDifference &difference);
    /// Reads again when a task has moved since, which mostly changes devices. How soon depends on what a
    /// reading costs.
    void reloadForTasks();
    /// The server has answered a check: reads what others may have changed, unless the last reading was so
    /// long that it is too early for another one.
    void reloadAfterRest();
    /// Reads the states alone, as soon as the service had time to act on what it was told.
    void readStatesSoon();
    /// The session has ended.
    void stop();

signals:
    /// Something was read; which parts, the reading tells.
    void read(const InventoryReader::Reading &reading);
    /// A reading has failed as a whole.
    void failed();
    void statesRead(const DeviceStatusUpdate &update);
    /// The reading of the states alone has ended, however it did.
    void statesSettled();

private:
    bool hasRested(int times) const;
    void take(InventoryReader::Reading reading, int siteCommits);
    void onEnded(JobOutcome end);

    const DeviceInventory &m_inventory;
    std::function<int()> m_siteCommits;
    NetTask::Owner m_netTask;
    QElapsedTimer m_sinceReading;  ///< since the last reading ended; invalid before the first one
    qint64 m_readingMs = 0;        ///< how long it took, without the wait for its turn
    DeviceDifference m_difference; ///< of the last poll
    DeviceDifference m_settled;    ///< the one that there was when a reading has succeeded
    bool m_reloading = false;
    bool m_reloadWanted = false;
    LoadState m_knowledge = LoadState::None;
};
