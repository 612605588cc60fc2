#pragma once

#include "apiresult.h"

#include <QStringList>

class ServiceSession;

/// What operations do on the service, one function each. For a runner's thread.
namespace DeviceOperations {

/// How an operation began; how it goes on shows in its task.
struct Outcome {
    unsigned result = ApiOk;
    QString tid; ///< the operation's task; empty where none could be made
};

/// Has the devices restart.
Outcome restart(ServiceSession &session, const QStringList &deviceIds);

} // namespace DeviceOperations
