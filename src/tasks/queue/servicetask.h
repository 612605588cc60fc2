#pragma once

#include "api/client/apiresult.h"
#include "platform/json.h"
#include "tasks/service/existingdevices.h"
#include "tasks/service/retryregistry.h"

#include <functional>

class ServiceSession;

/// The one way from a submitted operation to its task on the service, for the queues and for the operations
/// that start at once. For a runner's thread.
namespace ServiceTask {

/// How an operation began; how it goes on shows in its task.
struct Outcome {
    unsigned result = ApiOk;
    QString tid;               ///< the operation's task; empty where none could be made
    QStringList missing;       ///< ids that the service does not know any more; the others went on
    bool mayHaveBegun = false; ///< no response came: the service may be at work all the same
};

/// What an operation contributes.
struct Steps {
    QString type; ///< of the task
    /// The devices, with the parameters that travel on them, as newTaskState takes them.
    std::function<JSON()> devices;
    QStringList ids; ///< of all devices at the beginning
    /// From now on only these devices count.
    std::function<void(const ExistingDevices &)> keepOnly;
    /// How the task can be tried again.
    std::function<RetryRegistry::Repeat(const QString &tid)> retry;
    /// The task is made and shown in the list. May be null.
    std::function<void(const Outcome &)> made;
    /// Does the work under the task.
    std::function<unsigned(const QString &tid)> work;
};

/// Makes the task, shows it in the list, registers its retry and does the work. When the service refuses
/// because some of the devices were removed meanwhile, goes on with the others.
Outcome run(ServiceSession &session, const Steps &steps);

/// Makes one attempt and, when the service refuses it because devices are missing, another one without
/// these.
Outcome withoutMissing(ServiceSession &session, const QStringList &ids,
                       const std::function<void(const ExistingDevices &)> &keepOnly,
                       const std::function<Outcome()> &attempt);

} // namespace ServiceTask
