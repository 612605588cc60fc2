#pragma once

#include "devices/devicetargets.h"
#include "devices/devicework.h"

#include <functional>
#include <string_view>
#include <vector>

namespace emulator {

struct Model;
class Service;

/// What a request wants of a device.
using WorkFor = std::function<DeviceWork(const Device &)>;

/// Starts the work of the targets that name a task, under these tasks. All of it is judged before any of it
/// starts: throws Refusal when a target is unknown to its task, or a task is of another type than the given
/// one; empty stands for any.
void startUnderTasks(Model &model, const std::vector<Target> &targets, std::string_view type,
                     const WorkFor &workFor);

/// What came of work without a task.
enum class Outcome { Done, NoConnection, NotAuthorized, Failed };

/// Does a work at once.
Outcome doAtOnce(Model &model, Device &device, const DeviceWork &work);
/// Does what the targets without a task are to do, on those that can.
void doAtOnce(Model &model, const std::vector<Target> &targets, const WorkFor &workFor);

/// Has work done: under the tasks of the targets, at once where they name none.
void order(Service &service, const std::vector<Target> &targets, std::string_view type,
           const WorkFor &workFor);

/// Throws Refusal(UnknownId) when a target without a task is no managed device; those under a task fail
/// there.
void checkKnownWithoutTask(const Model &model, const std::vector<Target> &targets);

} // namespace emulator
