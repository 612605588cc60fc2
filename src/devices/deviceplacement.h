#pragma once

#include "deviceinventory.h"

#include <QObject>

#include <optional>

class DeviceActions;

/// Deletes devices, takes them out of sites and puts them into sites, as the user wants it at the console.
///
/// Between a choice and the answer to a question, readings may change the devices: what is sent are always
/// their present records. User-interface thread.
class DevicePlacement : public QObject {
    Q_OBJECT

public:
    /// over: the window that questions stand over; the object is its child. All of them outlive the object.
    DevicePlacement(const DeviceInventory &inventory, DeviceActions *actions, QWidget *over);

    /// Asks before the devices leave the site, or the service where the site is the overview.
    void askToRemove(const QStringList &deviceIds, const QString &siteId);
    /// Devices were dropped on a site.
    void drop(const QString &siteId, const QStringList &deviceIds, Qt::DropAction action,
              const QString &sourceSiteId);

signals:
    /// None of the devices is managed any more.
    void failed(const QString &message);

private:
    std::optional<PresentDevices> presentOf(const QStringList &deviceIds);

    const DeviceInventory &m_inventory;
    DeviceActions *m_actions;
    QWidget *m_over;
};
