#pragma once

#include "tables/tasktable.h"

#include <cstdint>
#include <string>

namespace emulator {

class DeviceTable;

/// The task that a request asks for, without a user yet. Its devices are named by their ids or by objects
/// that hold an "id" and parameters; the latest "actm" of these schedules it. An unmanaged device
/// fails by itself. Throws Refusal for an unknown type and where no known device is named.
Task requestedTask(const std::string &type, const Json &devices, const DeviceTable &known,
                   std::int64_t nowMs);

} // namespace emulator
