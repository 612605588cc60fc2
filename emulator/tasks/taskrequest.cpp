#include "tasks/taskrequest.h"

#include "http/response.h"
#include "tables/devicetable.h"
#include "tables/tasktable.h"

#include <algorithm>
#include <charconv>
#include <unordered_set>
#include <utility>

namespace emulator {

namespace {

[[noreturn]] void refuse(const std::string &why) {
    throw Refusal(Code::Malformed, why);
}

/// The time that the parameters ask for; 0 for none.
std::int64_t wantedTime(const Json &parameters) {
    const std::string text = optionalText(parameters, "actm");
    std::int64_t time = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), time);
    if (!text.empty() && (error != std::errc() || end != text.data() + text.size() || time < 0))
        refuse("\"actm\" is no time");
    return time;
}

/// Another client may have removed a device a moment ago; that ends its part of the task, not the task.
void identify(TaskDevice &device, const DeviceTable &devices) {
    if (const Device *known = devices.find(device.id)) {
        device.identity = identityText(*known);
        return;
    }
    device.identity = identityText(device.id, device.parameters);
    device.phase = TaskDevice::Phase::Ended;
    device.state = state::notManaged;
}

void judgeTargets(const Task &task) {
    if (task.devices.empty())
        refuse("a task needs devices");
    if (!std::any_of(task.devices.begin(), task.devices.end(),
                     [](const TaskDevice &device) { return device.phase != TaskDevice::Phase::Ended; }))
        throw Refusal(Code::UnknownId, "no device " + task.devices.front().id);
}

TaskDevice requestedDevice(const Json &element, const DeviceTable &devices) {
    if (!element.is_string() && !element.is_object())
        refuse("an element of \"devices\" names no device");
    TaskDevice device;
    device.id = element.is_string() ? element.get<std::string>() : textMember(element, "id");
    device.parameters = element.is_object() ? element : Json::object();
    identify(device, devices);
    return device;
}

} // namespace

Task requestedTask(const std::string &type, const Json &devices, const DeviceTable &known,
                   std::int64_t nowMs) {
    if (std::find(taskTypes().begin(), taskTypes().end(), type) == taskTypes().end())
        refuse("no task is a \"" + type + '"');
    Task task;
    std::unordered_set<std::string> seen;
    for (const Json &element : devices) {
        TaskDevice device = requestedDevice(element, known);
        task.scheduledAt = std::max(task.scheduledAt, wantedTime(device.parameters));
        if (seen.insert(device.id).second)
            task.devices.push_back(std::move(device));
    }
    judgeTargets(task);
    task.type = type;
    task.createdAt = task.updatedAt = nowMs;
    task.scheduledAt = task.scheduledAt > nowMs ? task.scheduledAt : 0;
    task.status = task.state = task.scheduledAt != 0 ? state::scheduled : state::init;
    for (TaskDevice &device : task.devices)
        device.state = device.phase == TaskDevice::Phase::Ended ? device.state : task.state;
    return task;
}

} // namespace emulator
