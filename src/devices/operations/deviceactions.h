#pragma once

#include "devices/inventory/deviceinventory.h"
#include "devices/operations/deviceoperations.h"
#include "devices/sites/sitemembership.h"

#include <QObject>

#include <functional>

class NetTask;

/// Starts operations on devices, tells when one could not begin, and remembers how to do them again. Each
/// runs on a runner of its own. User-interface thread.
class DeviceActions : public QObject {
    Q_OBJECT

public:
    using QObject::QObject;

    /// An operation that makes a task.
    struct PendingOperation {
        QString type; ///< of the task
        QStringList deviceIds;
        /// On the runner; see DeviceOperations::runTask.
        std::function<DeviceOperations::Outcome(const DeviceOperations::DeviceTask &)> run;
        bool needsInput = false; ///< holds a password, which is not kept for a retry
        QString retryOf = {};    ///< the task whose failed devices it is for; empty for none

        QString title() const;
    };

    void start(const PendingOperation &operation);
    /// runner: carries the request. begun: called when the operation has begun.
    void start(const PendingOperation &operation, NetTask *runner, const std::function<void()> &begun);
    /// Gives the service the credentials of the devices.
    void authorize(const QStringList &deviceIds, const QString &name, const QString &password);

    /// Deletes devices from the service for good. Here and below, what changes are the records that the
    /// service has at that moment, and what is done is told with how many devices were not there any more.
    void deleteDevices(const QStringList &deviceIds);
    /// Takes devices out of a site.
    void removeFromSite(const QStringList &deviceIds, const QString &siteId);
    /// Puts devices into a site; a move takes them out of the source site.
    void putIntoSite(const QStringList &deviceIds, const SiteMembership::Drop &drop);

    /// Writes the devices at the places to a file, in that order.
    void exportList(const QString &path, const DeviceSnapshotPtr &devices, const std::vector<int> &places);

signals:
    /// Something has begun that takes long; done or failed follows.
    void working(const QString &message);
    /// Something was done that has no task; the message says what.
    void done(const QString &message);
    /// The service's devices are others now, or belong to other sites.
    void devicesChanged();
    void devicesDeleted();
    /// States of devices have changed that the next poll shows.
    void statesChanged();
    /// A task of the type is to be tried again for these devices, and needs what was not kept.
    void inputNeeded(const QString &taskType, const QStringList &deviceIds);
    /// The operation could not begin; the message says which and why.
    void failed(const QString &message);

private:
    using Retry = std::function<RetryRegistry::Repeat(const QString &tid)>;

    /// The records to commit, made on the runner from the present ones, and what to say when they are.
    struct Change;
    struct CommitResult;
    void commit(const QString &name, const QStringList &deviceIds, std::function<Change(const JSON &)> change,
                std::function<void()> succeeded);
    static CommitResult rebaseAndSend(ServiceSession &session, const QStringList &deviceIds,
                                      const std::function<Change(const JSON &)> &change);

    Retry retryFor(const PendingOperation &operation);
    void allowRetry(const PendingOperation &operation);
    /// leftOut: a sentence about the devices that were not asked; empty for none.
    void tellAuthorized(const QStringList &deviceIds, const QString &leftOut);
};
