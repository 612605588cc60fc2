#pragma once

#include "devices/inventory/deviceinventory.h"
#include "tasks/service/taskrecord.h"

#include <functional>

/// A device that an operation is meant for, as it was when the user asked for the operation.
struct OperationTarget {
    DeviceRecordPtr device;
    DeviceStatusCode status = DeviceStatusCode::Unreachable;
    QString busyWith; ///< title of the task that works on it; empty for none
};

/// What speaks against an operation on some of its targets.
struct TargetWarning {
    std::function<QString(int)> summary; ///< for so many devices, as a sentence
    QString note;                        ///< beside each of the devices
    std::vector<int> targets;            ///< places in the list of targets
};

/// The devices that an operation is meant for.
namespace OperationTargets {

using List = std::vector<OperationTarget>;

/// What an operation asks of a device.
enum class Need {
    Connection,   ///< the service must reach it
    Account,      ///< and must have good credentials, unless the device has none yet
    Authorization ///< and must have good credentials
};

/// Of the devices, with what the inventory and the tasks say of them.
List of(const std::vector<DeviceRecordPtr> &devices, const DeviceInventory &inventory, const TaskList &tasks);

/// Which of the targets will fail as things stand, or are at work already.
std::vector<TargetWarning> warnings(const List &targets, Need need);

/// What a state of devices means for an operation.
struct StatusWarning {
    DeviceStatusCode status;
    std::function<QString(int)> summary;
    QString note;
};

/// The warnings for those states that some of the targets are in.
std::vector<TargetWarning> withStatus(const List &targets, const std::vector<StatusWarning> &warnings);

} // namespace OperationTargets
