#pragma once

#include "api/client/apiresult.h"
#include "devices/inventory/devicestatus.h"
#include "devices/inventory/passwordpolicy.h"

#include <QStringList>

#include <map>

class ServiceSession;

/// What operations do on the service, one function each. For a runner's thread.
namespace DeviceOperations {

/// How an operation began; how it goes on shows in its task.
struct Outcome {
    unsigned result = ApiOk;
    QString tid;               ///< the operation's task; empty where none could be made
    QStringList vanished;      ///< ids that the service does not know any more; the others went on
    bool mayHaveBegun = false; ///< it failed for want of an answer: the service may be at work all the same
};

/// Has the devices restart.
Outcome restart(ServiceSession &session, const QStringList &deviceIds);

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

/// Has the devices restore their settings to factory default.
Outcome restore(ServiceSession &session, const QStringList &deviceIds, const RestoreOptions &options);

/// Changes the password of an account on the devices.
Outcome changePassword(ServiceSession &session, const QStringList &deviceIds, const QString &name,
                       const QString &password);

/// Sets the rules that the devices hold passwords to.
Outcome setPasswordPolicy(ServiceSession &session, const QStringList &deviceIds,
                          const PasswordPolicy &policy);

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
/// The command that restores settings.
QByteArray restoreCommand(const RestoreOptions &options);

} // namespace DeviceOperations
