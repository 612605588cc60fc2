#pragma once

#include "api/session/nettask.h"
#include "devices/inventory/inventoryreader.h"

#include <QElapsedTimer>
#include <QObject>
#include <QTimer>

#include <memory>

/// The count of the monitor's ticks: what is due on each.
class MonitorBeat {
public:
    struct Due {
        bool poll = false;  ///< states, tasks and alarms
        bool check = false; ///< whether the server answers
    };

    /// One tick. A poll is due on every third one, a check on every sixth.
    Due tick();

    /// Makes a poll due on the next tick and counts anew from there.
    void forceRefresh() { m_force = true; }

private:
    unsigned m_count = 0;
    bool m_force = false;
};

/// Follows the devices of the present session: polls their states, and the service's tasks and alarms, once
/// in three seconds and looks every six whether the server answers. User-interface thread; requests run on a
/// runner of its own.
class DeviceMonitor : public QObject {
    Q_OBJECT

public:
    /// The inventory must outlive the monitor.
    explicit DeviceMonitor(const DeviceInventory &inventory, QObject *parent = nullptr);
    ~DeviceMonitor() override;

    void start();
    void stop();

    /// Polls on the next tick.
    void forceRefresh() { m_beat.forceRefresh(); }

public slots:
    /// The slot of the one-second timer.
    void monitorLoop();

signals:
    /// At the end of every tick.
    void ticked();
    /// A poll has succeeded.
    void updateStatus(const DeviceStatusUpdate &update);
    /// The server answered a check.
    void serverAnswered();
    /// The server did not answer a check.
    void serverLost();

private:
    void poll();
    void checkConnection();

    const DeviceInventory &m_inventory;
    MonitorBeat m_beat;
    QTimer m_timer;
    NetTask::Owner m_runner;
    /// Shared with the poll under way, which may outlive the monitor.
    std::shared_ptr<StatusCache> m_statusCache = std::make_shared<StatusCache>();
    bool m_busy = false;
};
