#pragma once

#include "devices/devicework.h"
#include "http/uploadedfile.h"

namespace emulator {

struct Device;

/// The work of a device that gets an application package, in its own memory or on its card. A device has four
/// slots for packages; one with the name of another takes its slot.
DeviceWork packageWork(const UploadedFile &file, bool onCard, const Device &device);

} // namespace emulator
