#include "deviceplacement.h"

#include "confirmdialog.h"
#include "deviceactions.h"
#include "sitelist.h"

DevicePlacement::DevicePlacement(DeviceActions *actions, QWidget *over)
    : QObject(over), m_actions(actions), m_over(over) {}

void DevicePlacement::askToRemove(const QStringList &deviceIds, const QString &siteId) {
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

void DevicePlacement::remove(bool fromOverview) {
    if (fromOverview)
        m_actions->deleteDevices(m_toRemove);
    else
        m_actions->removeFromSite(m_toRemove, m_siteToLeave);
}

void DevicePlacement::drop(const QString &siteId, const QStringList &deviceIds, Qt::DropAction action,
                           const QString &sourceSiteId) {
    m_actions->putIntoSite(deviceIds, {siteId, sourceSiteId, action == Qt::MoveAction});
}
