#include "deviceplacement.h"

#include "confirmdialog.h"
#include "deviceactions.h"
#include "sitelist.h"

DevicePlacement::DevicePlacement(const DeviceInventory &inventory, DeviceActions *actions, QWidget *over)
    : QObject(over), m_inventory(inventory), m_actions(actions), m_over(over) {}

/// Those that are still there; nothing, and told, where none is.
std::optional<PresentDevices> DevicePlacement::presentOf(const QStringList &deviceIds) {
    PresentDevices present = m_inventory.snapshot()->presentOf(deviceIds);
    if (!present.records.empty())
        return present;
    emit failed(tr("The devices are not managed any more."));
    return std::nullopt;
}

void DevicePlacement::askToRemove(const QStringList &deviceIds, const QString &siteId) {
    if (deviceIds.isEmpty())
        return;
    const bool forGood = siteId == Sites::overviewId;
    const auto kind = forGood ? ConfirmDialog::Kind::DeleteDevices : ConfirmDialog::Kind::RemoveFromSite;
    auto *confirm = new ConfirmDialog(kind, m_over, static_cast<int>(deviceIds.size()));
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(confirm, &QDialog::accepted, this, [this, deviceIds, siteId, forGood] {
        const std::optional<PresentDevices> devices = presentOf(deviceIds);
        if (devices && forGood)
            m_actions->deleteDevices(*devices);
        else if (devices)
            m_actions->removeFromSite(*devices, siteId);
    });
    confirm->open();
}

void DevicePlacement::drop(const QString &siteId, const QStringList &deviceIds, Qt::DropAction action,
                           const QString &sourceSiteId) {
    if (const std::optional<PresentDevices> devices = presentOf(deviceIds))
        m_actions->putIntoSite(*devices, {siteId, sourceSiteId, action == Qt::MoveAction});
}
