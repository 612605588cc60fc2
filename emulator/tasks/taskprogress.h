#pragma once

#include "tables/tasktable.h"

#include <cstddef>
#include <optional>
#include <string>

namespace emulator {

/// How a task stands, read off its devices.

bool isFirmware(const Task &task);

/// The state of a device that is at work.
const char *runningState(const Task &task, const TaskDevice &device);

std::optional<std::size_t> nextQueued(const Task &task);
bool any(const Task &task, TaskDevice::Phase phase);
int meanProgress(const Task &task);

/// The state of a task of which some devices run.
std::string shownState(const Task &task);

} // namespace emulator
