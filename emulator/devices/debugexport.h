#pragma once

#include <string>

namespace emulator {

struct Model;
struct Task;

/// The zip of an export that has ended: a text for each device that reported something. Throws
/// Refusal(Malformed) for a task that is no such export, has not ended, or got nothing from any device.
std::string debugExport(const Model &model, Task &task);

} // namespace emulator
