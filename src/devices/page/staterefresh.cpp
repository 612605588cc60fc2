#include "devices/page/staterefresh.h"

#include "api/session/servicerequest.h"
#include "devices/inventory/inventoryreader.h"

#include <QApplication>
#include <QDebug>

#include <nlohmann/json.hpp>

#include <chrono>
#include <thread>

using namespace std::chrono_literals;

namespace {
constexpr auto refreshDelay = 2000ms;
} // namespace

StateRefresh::StateRefresh(const DeviceInventory &inventory, QWidget *over)
    : QObject(over), m_inventory(inventory), m_over(over) {}

void StateRefresh::open() {
    if (m_dialog)
        return;
    QWidget *modal = QApplication::activeModalWidget();
    m_dialog = new RefreshDeviceDialog(modal ? modal : m_over);
    m_dialog->setAttribute(Qt::WA_DeleteOnClose);
    connect(m_dialog, &RefreshDeviceDialog::refresh, this, &StateRefresh::onRefreshAll);
    connect(m_dialog, &RefreshDeviceDialog::refreshDone, this, &StateRefresh::ended);
    connect(m_dialog, &QDialog::rejected, this, &StateRefresh::ended);
    m_dialog->open();
}

void StateRefresh::onRefreshAll() {
    if (onRefreshDevice(m_dialog))
        return;
    m_dialog->finish();
    emit failed(tr("The device states could not be read: the client is busy, try again."));
}

/// Reads the states for a dialog. On a runner of its own, since that of a refresh which was cancelled may
/// still be at work. False when there is none.
bool StateRefresh::onRefreshDevice(const QPointer<RefreshDeviceDialog> &dialog) {
    qDebug("onRefreshDevice@@@@@");
    const auto read = [snapshot = m_inventory.snapshot(),
                       codes = m_inventory.statuses()](ServiceSession &session) {
        return InventoryReader::readStatus(session, snapshot, codes);
    };
    return ServiceRequest::post(
        NetJob::createRunner("refreshing the device states", NetTask::Turn::Reading), this, read,
        [this, dialog](const std::optional<DeviceStatusUpdate> &update) {
            if (update)
                emit statesRead(*update);
            else if (dialog)
                emit failed(tr("The device states could not be read. Try again."));
        },
        [this, dialog](JobOutcome end) {
            // Whoever has cancelled it does not wait for its outcome.
            if (!dialog)
                return;
            dialog->finish();
            if (end == JobOutcome::NotRun)
                emit failed(tr("The device states could not be read: the client is busy, try again."));
            else if (end == JobOutcome::Failed)
                emit failed(tr("The device states could not be read. Try again."));
        },
        // The devices need a moment to settle; the wait must not keep other jobs from their turn.
        [] { std::this_thread::sleep_for(refreshDelay); });
}

void StateRefresh::close() {
    if (m_dialog)
        m_dialog->close();
}
