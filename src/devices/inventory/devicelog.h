#pragma once

#include "devices/inventory/deviceinventory.h"

#include <vector>

/// The log lines about many devices at once. They are written on a thread of their own: for a large fleet
/// they take longer than a window may stand still.
namespace DeviceLog {

/// Logs the devices that a new reading adds to the tables.
void tablesFilled(const DeviceSnapshotPtr &snapshot, const DeviceSnapshotPtr &previous);

/// Logs the selected records and their ids.
void selectionChanged(std::vector<DeviceRecordPtr> devices);

} // namespace DeviceLog
