#pragma once

#include <QObject>
#include <QStringList>

class DeviceActions;

/// Deletes devices, takes them out of sites and puts them into sites, as the user wants it at the console.
/// User-interface thread.
class DeviceSiteActions : public QObject {
    Q_OBJECT

public:
    /// over: the window that questions stand over; the object is its child. All of them outlive the object.
    DeviceSiteActions(DeviceActions *actions, QWidget *over);

    /// Asks whether the devices are to leave the site, or the service where the site is the overview.
    void askToRemove(const QStringList &deviceIds, const QString &siteId);
    /// Removes those that were asked about, from the service or from that site.
    void remove(bool fromOverview);
    /// Devices were dropped on a site.
    void drop(const QString &siteId, const QStringList &deviceIds, Qt::DropAction action,
              const QString &sourceSiteId);

signals:
    /// The user wants the devices that were asked about removed.
    void removalConfirmed(bool fromOverview);

private:
    DeviceActions *m_actions;
    QWidget *m_over;
    QStringList m_toRemove;
    QString m_siteToLeave;
};
