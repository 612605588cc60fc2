#pragma once

#include "device_work.h"
#include "uploaded_file.h"

namespace emulator {

struct Device;

/// The work of a device that gets an application package, in its own memory or on its card. A device has four
/// slots for packages; one with the name of another takes its slot.
DeviceWork packageWork(const UploadedFile &file, bool onCard, const Device &device);

} // namespace emulator
