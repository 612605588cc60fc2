#include "devices/page/devicesiteactions.h"

#include "devices/operations/deviceactions.h"
#include "devices/sites/sitelist.h"
#include "widgets/dialogs/confirmdialog.h"

DeviceSiteActions::DeviceSiteActions(DeviceActions *actions, QWidget *over)
    : QObject(over), m_actions(actions), m_over(over) {}

void DeviceSiteActions::askToRemove(const QStringList &deviceIds, const QString &siteId) {
    if (deviceIds.isEmpty())
        return;
    const bool forGood = siteId == Sites::overviewId;
    const auto kind = forGood ? ConfirmDialog::Kind::DeleteDevices : ConfirmDialog::Kind::RemoveFromSite;
    auto *confirm = new ConfirmDialog(kind, m_over, static_cast<int>(deviceIds.size()));
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    m_toRemove = deviceIds;
    m_siteToLeave = siteId;
    connect(confirm, &QDialog::accepted, this, [this, forGood] { emit removalConfirmed(forGood); });
    confirm->open();
}

void DeviceSiteActions::remove(bool fromOverview) {
    if (fromOverview)
        m_actions->deleteDevices(m_toRemove);
    else
        m_actions->removeFromSite(m_toRemove, m_siteToLeave);
}

void DeviceSiteActions::drop(const QString &siteId, const QStringList &deviceIds, Qt::DropAction action,
                             const QString &sourceSiteId) {
    m_actions->putIntoSite(deviceIds, {siteId, sourceSiteId, action == Qt::MoveAction});
}
