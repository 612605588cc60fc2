#pragma once

#include "deviceinventory.h"
#include "deviceoperations.h"
#include "sitemembership.h"

#include <QObject>

#include <functional>

/// Starts operations on devices, tells when one could not begin, and remembers how to do them again. Each
/// runs on a runner of its own. User-interface thread.
class DeviceActions : public QObject {
    Q_OBJECT

public:
    using QObject::QObject;

    void restart(const QStringList &deviceIds);

    /// Deletes devices from the service for good.
    void deleteDevices(const std::vector<DeviceRecordPtr> &devices);
    /// Takes devices out of a site.
    void removeFromSite(const std::vector<DeviceRecordPtr> &devices, const QString &siteId);
    /// Puts devices into a site; a move takes them out of the source site.
    void putIntoSite(const std::vector<DeviceRecordPtr> &devices, const SiteMembership::Drop &drop);

    /// Writes the devices at the places to a file, in that order.
    void exportList(const QString &path, const DeviceSnapshotPtr &devices, const std::vector<int> &places);

signals:
    /// Something was done that has no task; the message says what.
    void done(const QString &message);
    /// The service's devices are others now, or belong to other sites.
    void devicesChanged();
    void devicesDeleted();
    /// The operation could not begin; the message says which and why.
    void failed(const QString &message);

private:
    using Operation = DeviceOperations::Outcome (*)(ServiceSession &, const QStringList &);

    /// The records to commit, made on the runner, and what to say when they are.
    struct Change;
    void commit(const QString &name, std::function<Change()> change, std::function<void()> succeeded);

    /// name: of the operation, for messages.
    void start(const QString &name, Operation operation, const QStringList &deviceIds);
};
