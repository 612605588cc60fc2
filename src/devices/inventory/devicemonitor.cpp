#include "devices/inventory/devicemonitor.h"

#include "api/session/servicerequest.h"
#include "platform/log/messagelog.h"
#include "tasks/service/taskinfopool.h"

#include <QDebug>

#include <chrono>
#include <new>

using namespace std::chrono_literals;

MonitorBeat::Due MonitorBeat::tick() {
    ++m_count;
    const bool forced = std::exchange(m_force, false);
    if (forced)
        m_count = 1;
    return {forced || m_count % 3 == 0, m_count % 6 == 0};
}

DeviceMonitor::DeviceMonitor(const DeviceInventory &inventory, QObject *parent)
    : QObject(parent), m_inventory(inventory), m_runner(new (std::nothrow) NetTask(NetTask::Turn::Reading)) {
    if (!m_runner)
        qDebug("monitor task create failed!should not be this case!");
    m_timer.setInterval(1000ms);
    connect(&m_timer, &QTimer::timeout, this, &DeviceMonitor::monitorLoop);
}

DeviceMonitor::~DeviceMonitor() = default;

void DeviceMonitor::start() {
    m_beat = MonitorBeat();
    m_timer.start();
}

void DeviceMonitor::stop() {
    m_timer.stop();
}

void DeviceMonitor::monitorLoop() {
    const MonitorBeat::Due due = m_beat.tick();
    if (due.poll) {
        poll();
        CTaskInfoPool::instance().loadTaskStatuses();
        CTaskInfoPool::instance().loadAlarmInfo();
    }
    if (due.check)
        checkConnection();
    emit ticked();
}

void DeviceMonitor::poll() {
    // Without devices there is nothing to show, and the poll would only delay the first reading of the list.
    if (m_busy || m_inventory.snapshot()->size() == 0)
        return;
    const auto read = [snapshot = m_inventory.snapshot(), codes = m_inventory.statuses(),
                       cache = m_statusCache](ServiceSession &session) {
        const MessageLog::PollScope counted;
        return InventoryReader::readStatus(session, snapshot, codes, cache.get());
    };
    // The flag goes when the runner ends, whatever became of the job.
    m_busy = ServiceRequest::post(
        m_runner.get(), this, read,
        [this](const std::optional<DeviceStatusUpdate> &update) {
            if (update)
                emit updateStatus(*update);
        },
        [this](JobOutcome) { m_busy = false; });
}

void DeviceMonitor::checkConnection() {
    const LoginInfo login = CLocalStore::instance().loginInfo();
    if (!login.isComplete())
        return;
    // In the user-interface thread on purpose: nothing else should be begun on a server that is gone. The
    // probe's own time-outs bound the wait.
    std::uint32_t online = 0;
    unsigned result = ApiException;
    NetTask::runAndWait([&] {
        const MessageLog::PollScope counted;
        result =
            ServiceSession(login).call([&](CApiClient &client) { return client.isServerOnline(online); });
    });
    if (online)
        emit serverAnswered();
    else if (result != ApiKeyChanged || !SessionEvents::instance().isKeyInQuestion())
        emit serverLost();
}
