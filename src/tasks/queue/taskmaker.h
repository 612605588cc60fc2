#pragma once

#include "platform/json.h"

#include <string>

class ServiceSession;

/// Makes tasks on the service. For a runner's thread.
namespace TaskMaker {

/// Makes a task for the devices and gives its id. When the answer is lost the task is looked up in the
/// service's list, so that no second one is made for the same. Otherwise as CApiClient::newTaskState;
/// ApiMissingData for a task without an id.
unsigned make(ServiceSession &session, const char *serviceType, const JSON &devices, std::string &tid);

} // namespace TaskMaker
