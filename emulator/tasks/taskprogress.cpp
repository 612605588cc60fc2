#include "tasks/taskprogress.h"

#include <algorithm>
#include <array>

namespace emulator {

bool isFirmware(const Task &task) {
    return task.type == "deviceFWUpgrade";
}

const char *runningState(const Task &task, const TaskDevice &device) {
    static constexpr std::array phases = {state::uploading, state::updating, state::reconnecting};
    if (!isFirmware(task) || device.step == 0)
        return state::processing;
    return phases[static_cast<std::size_t>(device.step) * phases.size() /
                  static_cast<std::size_t>(device.steps)];
}

std::optional<std::size_t> nextQueued(const Task &task) {
    for (std::size_t i = 0; i < task.devices.size(); ++i)
        if (task.devices[i].phase == TaskDevice::Phase::Queued)
            return i;
    return std::nullopt;
}

bool any(const Task &task, TaskDevice::Phase phase) {
    return std::any_of(task.devices.begin(), task.devices.end(),
                       [&](const TaskDevice &device) { return device.phase == phase; });
}

int meanProgress(const Task &task) {
    std::size_t sum = 0;
    for (const TaskDevice &device : task.devices)
        sum += static_cast<std::size_t>(device.progress);
    return static_cast<int>(sum / std::max<std::size_t>(task.devices.size(), 1));
}

std::string shownState(const Task &task) {
    const std::string first = task.devices[*std::min_element(task.running.begin(), task.running.end())].state;
    // A device that takes the place of another does not begin the task a second time.
    const bool again = isFirmware(task) && first == state::processing && any(task, TaskDevice::Phase::Ended);
    return again ? state::uploading : first;
}

} // namespace emulator
