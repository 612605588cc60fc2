#pragma once

#include "devices/inventory/devicestatus.h"
#include "tasks/queue/servicetask.h"

#include <QStringList>

#include <functional>
#include <map>

class ServiceSession;

/// What operations have the service do. For a runner's thread.
namespace DeviceOperations {

using ServiceTask::Outcome;

/// An operation that makes a task for devices.
struct DeviceTask {
    ServiceSession &session;
    QString type;
    QStringList deviceIds;
    std::function<RetryRegistry::Repeat(const QString &tid)> retry;
};

using Work = std::function<unsigned(const QStringList &deviceIds, const QString &tid)>;

/// Makes the task and does the work under it, for the devices that the service still has.
Outcome runTask(const DeviceTask &task, const Work &work);
/// The same where the work is a command to the devices.
Outcome runCommand(const DeviceTask &task, const QByteArray &command);

/// What a restore to factory default does with parts of the settings, in the values that devices take: 1
/// keeps a part, -1 resets it.
struct RestoreOptions {
    int network = -1;
    int daylightSaving = -1;
    int language = -1;
    int nadp = -1;
    int focus = -1;
    int lens = -1;
};

/// Gives the service the credentials for the devices. There is no task for it; what the devices say to the
/// credentials shows in their states, some time later.
Outcome authorize(ServiceSession &session, const QStringList &deviceIds, const QString &name,
                  const QString &password);

/// How many of the devices are in which state; nothing where it could not be read.
std::map<DeviceStatusCode, int> readStates(ServiceSession &session, const QStringList &deviceIds);

/// The command that changes an account's password, cut to what a device takes.
QByteArray passwordCommand(const QString &name, const QString &password);
/// How many bytes name and password may have together without being cut.
int roomInPasswordCommand();
/// Ids as they are logged.
QByteArray dumpIds(const QStringList &deviceIds);
/// The command that restores settings.
QByteArray restoreCommand(const RestoreOptions &options);

} // namespace DeviceOperations
