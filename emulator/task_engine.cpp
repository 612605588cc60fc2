#include "task_engine.h"

#include "answer.h"
#include "device_maker.h"
#include "device_table.h"
#include "log_table.h"
#include "random.h"
#include "store.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <iterator>
#include <optional>
#include <sstream>
#include <utility>

namespace emulator {

namespace {

using Phase = TaskDevice::Phase;

constexpr std::size_t mostAtOnce = 20;
constexpr int leastSteps = 6;
constexpr int outageStep = 2;
constexpr int outageSteps = 3;
constexpr auto firmware = "deviceFWUpgrade";

std::vector<std::string> wordsOf(const char *text) {
    std::istringstream stream(text);
    return {std::istream_iterator<std::string>(stream), {}};
}

[[noreturn]] void refuse(const std::string &why) {
    throw Refusal(Code::Malformed, why);
}

/// The time that the parameters ask for; 0 for none.
std::int64_t wantedTime(const Json &parameters) {
    const std::string text = optionalText(parameters, "actm");
    std::int64_t time = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), time);
    if (!text.empty() && (error != std::errc() || end != text.data() + text.size() || time < 0)) {
        refuse("\"actm\" is no time");
    }
    return time;
}

bool isRestart(const std::string &type) {
    return type == "deviceRestart" || type == "deviceRestore";
}

const char *runningState(const Task &task, const TaskDevice &device) {
    static constexpr std::array phases = {state::uploading, state::updating, state::reconnecting};
    if (task.type != firmware || device.step == 0) {
        return state::processing;
    }
    return phases[static_cast<std::size_t>(device.step) * phases.size() /
                  static_cast<std::size_t>(device.steps)];
}

std::optional<std::size_t> nextQueued(const Task &task) {
    for (std::size_t i = 0; i < task.devices.size(); ++i) {
        if (task.devices[i].phase == Phase::Queued) {
            return i;
        }
    }
    return std::nullopt;
}

bool any(const Task &task, Phase phase) {
    return std::any_of(task.devices.begin(), task.devices.end(),
                       [&](const TaskDevice &device) { return device.phase == phase; });
}

int meanProgress(const Task &task) {
    std::size_t sum = 0;
    for (const TaskDevice &device : task.devices) {
        sum += static_cast<std::size_t>(device.progress);
    }
    return static_cast<int>(sum / std::max<std::size_t>(task.devices.size(), 1));
}

std::string shownState(const Task &task) {
    const std::string first = task.devices[*std::min_element(task.running.begin(), task.running.end())].state;
    // A device that takes the place of another does not begin the task a second time.
    const bool again = task.type == firmware && first == state::processing && any(task, Phase::Ended);
    return again ? state::uploading : first;
}

} // namespace

const std::vector<std::string> &taskTypes() {
    static const auto types =
        wordsOf("deviceConfigFileUpload deviceFWUpgrade deviceGenSelfSignedCert deviceHttpsCertInstall "
                "deviceHttpsCertsAndPKeys deviceIEEE_EAP_PEAP deviceIEEE_EAP_TLS devicePackageUpload "
                "deviceAssignIPAuto deviceAssignIPManual deviceExportDeviceInfo deviceQuickSetup "
                "deviceRestart deviceRestore deviceChangePass devicePassPolicy deviceCreateTemplate "
                "deviceSetTemplate deviceCustomCommand");
    return types;
}

std::string failureCode(Random &random) {
    // Those that end in an underscore go on with the number of a slot.
    static const auto codes = wordsOf(
        "pTaskMismatchingStatus pTaskUnsupportedMethod pTaskMismatchingPrivateKeyAndCertificate "
        "pTaskInvalidFileOrPublicKey pTaskCertificateNotInstalled pTaskNotInstalled "
        "pTaskDeviceResponseTimeout pTaskDeviceResponseTimeoutEx pTaskFailedToConnectToDevice "
        "pTaskFailedToConnectToDeviceEx pTaskFailedToSetPassword pTaskInvalidFileForThisModelGroup "
        "pTaskIncompatibleFirmware pTaskNoSdCardDetected pTaskSdCardError_ pTaskMaxPackageUploadLimit_ "
        "pTaskInsufficientStorage_ pTaskBrokenFile_ pInternalProcessError_");
    const std::string &code = codes[random.below(codes.size())];
    const std::uint64_t slot = 1 + random.below(16);
    return code.ends_with('_') ? code + (slot < 10 ? "0" : "") + std::to_string(slot) : code;
}

TaskEngine::TaskEngine(Store &store, TaskTable &tasks, DeviceTable &devices, LogTable &log)
    : m_store(store), m_tasks(tasks), m_devices(devices), m_log(log), m_open(tasks.open()) {}

Task &TaskEngine::create(const std::string &type, const std::string &user, const Json &devices,
                         std::int64_t nowMs) {
    if (std::find(taskTypes().begin(), taskTypes().end(), type) == taskTypes().end()) {
        refuse("no task is a \"" + type + '"');
    }
    Task task;
    std::unordered_set<std::string> seen;
    for (const Json &element : devices) {
        TaskDevice device;
        if (!element.is_string() && !element.is_object()) {
            refuse("an element of \"devices\" names no device");
        }
        device.id = element.is_string() ? element.get<std::string>() : textMember(element, "id");
        device.identity = identityText(m_devices.get(device.id));
        device.parameters = element.is_object() ? element : Json::object();
        task.scheduledAt = std::max(task.scheduledAt, wantedTime(device.parameters));
        if (seen.insert(device.id).second) {
            task.devices.push_back(std::move(device));
        }
    }
    if (task.devices.empty()) {
        refuse("a task needs devices");
    }
    task.type = type;
    task.user = user;
    task.createdAt = task.updatedAt = nowMs;
    task.scheduledAt = task.scheduledAt > nowMs ? task.scheduledAt : 0;
    task.status = task.state = task.scheduledAt != 0 ? state::scheduled : state::init;
    for (TaskDevice &device : task.devices) {
        device.state = task.state;
    }
    Transaction transaction(m_store.database());
    m_log.add(nowMs, "System", "Audit",
              "Task " + type + " created, devices: " + std::to_string(task.devices.size()), user);
    Task &added = m_tasks.add(std::move(task));
    transaction.commit();
    m_open.push_back(&added);
    return added;
}

void TaskEngine::judgeWork(const std::string &taskId, const std::vector<DeviceWork> &work) const {
    const Task &task = m_tasks.get(taskId);
    std::unordered_set<std::string> waiting;
    for (const TaskDevice &device : task.devices) {
        if (device.phase == Phase::WithoutWork) {
            waiting.insert(device.id);
        }
    }
    if (work.empty()) {
        refuse("the work names no device");
    }
    for (const DeviceWork &item : work) {
        if (waiting.erase(item.id) == 0) {
            refuse("device " + item.id + " waits for no work under this task");
        }
    }
}

void TaskEngine::startWork(const std::string &taskId, const std::vector<DeviceWork> &work,
                           std::int64_t nowMs) {
    judgeWork(taskId, work);
    Task &task = m_tasks.get(taskId);
    std::unordered_map<std::string, const DeviceWork *> items;
    for (const DeviceWork &item : work) {
        items[item.id] = &item;
    }
    for (TaskDevice &device : task.devices) {
        const auto found = items.find(device.id);
        if (found == items.end()) {
            continue;
        }
        device.phase = Phase::Queued;
        device.state = task.status == state::scheduled ? state::scheduled : state::queued;
        device.changes = found->second->changes;
        device.failure = found->second->failure;
        device.restarts = found->second->restarts || isRestart(task.type);
    }
    // Devices are seen to queue before the first of them are taken.
    task.startsAt = nowMs + m_rules.paceMs;
    refresh(task, nowMs);
    m_tasks.save(task);
}

void TaskEngine::close(const std::string &taskId, const std::string &finalState, std::int64_t nowMs) {
    Task &task = m_tasks.get(taskId);
    if (!isFinal(finalState) || isFinal(task.status)) {
        refuse("the task cannot become " + finalState);
    }
    for (TaskDevice &device : task.devices) {
        if (device.phase != Phase::Ended) {
            end(task, device, finalState);
        }
    }
    task.progress = meanProgress(task);
    finish(task, finalState, nowMs);
}

void TaskEngine::remove(const std::unordered_set<std::string> &taskIds) {
    for (const std::string &id : taskIds) {
        if (!isFinal(m_tasks.get(id).status)) {
            refuse("task " + id + " has not ended");
        }
    }
    m_tasks.remove(taskIds);
}

void TaskEngine::settle(std::int64_t nowMs) {
    if (!m_open.empty()) {
        Transaction transaction(m_store.database());
        // A task that ends leaves the list.
        for (Task *task : std::vector<Task *>(m_open)) {
            settleTask(*task, nowMs);
        }
        transaction.commit();
    }
    endOutages(nowMs);
}

void TaskEngine::settleTask(Task &task, std::int64_t nowMs) {
    const bool wakes = task.status == state::scheduled && nowMs >= task.scheduledAt;
    if (wakes) {
        wake(task, nowMs);
    }
    bool changed = dropOverdue(task, nowMs) || wakes;
    if (task.status != state::scheduled && nowMs >= task.startsAt) {
        changed = run(task, nowMs) || changed;
    }
    if (changed) {
        refresh(task, nowMs);
    }
}

void TaskEngine::wake(Task &task, std::int64_t nowMs) {
    task.status = state::init;
    task.startsAt = nowMs;
    for (TaskDevice &device : task.devices) {
        device.state = device.phase == Phase::Queued ? state::queued : state::init;
    }
}

/// Work that never comes is given up; a scheduled task may have it as late as at its time.
bool TaskEngine::dropOverdue(Task &task, std::int64_t nowMs) const {
    if (nowMs < std::max(task.createdAt, task.scheduledAt) + m_rules.workTimeoutMs) {
        return false;
    }
    bool dropped = false;
    for (TaskDevice &device : task.devices) {
        if (device.phase == Phase::WithoutWork) {
            device.phase = Phase::Ended;
            device.state = state::failed;
            dropped = true;
        }
    }
    return dropped;
}

bool TaskEngine::run(Task &task, std::int64_t nowMs) {
    // After a restart of the program the time begins with the first look.
    task.startsAt = task.startsAt == 0 ? nowMs : task.startsAt;
    bool changed = fillPlaces(task);
    for (std::size_t place = 0; place < task.running.size();) {
        TaskDevice &device = task.devices[task.running[place]];
        if (device.dueAt > nowMs) {
            ++place;
            continue;
        }
        changed = true;
        advance(task, device);
        const auto next = device.phase == Phase::Ended ? nextQueued(task) : std::nullopt;
        if (device.phase != Phase::Ended) {
            device.dueAt += m_rules.paceMs;
        } else if (next) {
            task.running[place] = *next;
            begin(task, *next, device.dueAt);
        } else {
            task.running.erase(task.running.begin() + static_cast<std::ptrdiff_t>(place));
        }
    }
    return changed;
}

bool TaskEngine::fillPlaces(Task &task) {
    bool filled = false;
    while (task.running.size() < mostAtOnce) {
        const auto next = nextQueued(task);
        if (!next) {
            break;
        }
        task.running.push_back(*next);
        begin(task, *next, task.startsAt);
        filled = true;
    }
    return filled;
}

void TaskEngine::begin(Task &task, std::size_t index, std::int64_t nowMs) {
    TaskDevice &device = task.devices[index];
    Random random(mixed(m_rules.seed ^ mixed(static_cast<std::uint64_t>(task.row))) ^ mixed(index));
    device.phase = Phase::Running;
    device.state = state::processing;
    device.step = 0;
    device.steps = leastSteps + static_cast<int>(random.below(3));
    device.failsAt = 1 + static_cast<int>(random.below(static_cast<std::uint64_t>(device.steps)));
    if (random.chance(m_rules.failures) && device.failure.empty()) {
        device.failure = failureCode(random);
    }
    device.dueAt = nowMs + m_rules.paceMs;
    if (Device *target = m_devices.find(device.id)) {
        target->action = task.type;
    }
}

void TaskEngine::advance(const Task &task, TaskDevice &device) {
    Device &target = m_devices.get(device.id);
    ++device.step;
    if (const auto outage = m_outages.find(device.id);
        outage != m_outages.end() && outage->second.endsAt <= device.dueAt) {
        endOutage(device.id, outage->second);
        m_outages.erase(outage);
    }
    if (!target.reachable && !m_outages.contains(device.id)) {
        const bool lately = device.step > 1;
        return end(task, device, lately ? "pTaskFailedToConnectToDeviceEx" : "pTaskFailedToConnectToDevice");
    }
    if (!device.failure.empty() && device.step >= device.failsAt) {
        return end(task, device, device.failure);
    }
    if (device.step == device.steps) {
        return succeed(task, device);
    }
    if (device.restarts && device.step == outageStep) {
        target.reachable = false;
        m_outages[device.id] = {device.dueAt + outageSteps * m_rules.paceMs, {}};
    }
    device.state = runningState(task, device);
    device.progress = device.step * 100 / device.steps;
}

void TaskEngine::succeed(const Task &task, TaskDevice &device) {
    if (!device.changes.empty()) {
        Device &target = m_devices.get(device.id);
        m_devices.update(target, withMembers(target, device.changes));
    }
    device.progress = 100;
    end(task, device, state::done);
}

void TaskEngine::end(const Task &task, TaskDevice &device, const std::string &finalState) {
    Device *target = device.phase == Phase::Running ? m_devices.find(device.id) : nullptr;
    if (target && target->action == task.type) {
        target->action = standby;
    }
    device.phase = Phase::Ended;
    device.state = finalState;
}

/// Draws a task's own state from those of its devices.
void TaskEngine::refresh(Task &task, std::int64_t nowMs) {
    task.devicesText.clear();
    task.updatedAt = nowMs;
    task.progress = meanProgress(task);
    const bool waits = any(task, Phase::WithoutWork);
    if (!task.running.empty()) {
        task.status = state::processing;
        task.state = shownState(task);
    } else if (task.status == state::scheduled) {
        return;
    } else if (any(task, Phase::Queued)) {
        task.status = task.state = state::queued;
    } else if (waits) {
        task.status = task.state = state::init;
    } else {
        const bool failed = std::any_of(task.devices.begin(), task.devices.end(),
                                        [](const TaskDevice &device) { return device.state != state::done; });
        finish(task, failed ? state::failed : state::done, nowMs);
    }
}

void TaskEngine::finish(Task &task, const std::string &finalState, std::int64_t nowMs) {
    task.status = task.state = finalState;
    task.updatedAt = nowMs;
    task.devicesText.clear();
    std::erase(m_open, &task);
    Transaction transaction(m_store.database());
    m_tasks.save(task);
    m_log.add(nowMs, "System", "Event", "Task " + task.type + " ended: " + finalState, task.user);
    transaction.commit();
}

void TaskEngine::restart(Device &device, const std::string &action, std::int64_t nowMs) {
    if (device.reachable) {
        // It is not written down: a device comes back from a restart, whatever becomes of this program.
        device.reachable = false;
        device.action = action;
        m_outages[device.id] = {nowMs + outageSteps * m_rules.paceMs, action};
    }
}

void TaskEngine::endOutages(std::int64_t nowMs) {
    std::erase_if(m_outages, [&](const auto &entry) {
        const bool ends = entry.second.endsAt <= nowMs;
        if (ends) {
            endOutage(entry.first, entry.second);
        }
        return ends;
    });
}

void TaskEngine::endOutage(const std::string &deviceId, const Outage &outage) {
    if (Device *device = m_devices.find(deviceId)) {
        device->reachable = !device->held;
        device->action = device->action == outage.action ? standby : device->action;
    }
}

void TaskEngine::forget(const std::unordered_set<std::string> &deviceIds, std::int64_t nowMs) {
    for (Task *task : std::vector<Task *>(m_open)) {
        if (std::erase_if(task->devices, [&](const auto &device) { return deviceIds.contains(device.id); }) ==
            0) {
            continue;
        }
        task->running.clear();
        for (std::size_t i = 0; i < task->devices.size(); ++i) {
            if (task->devices[i].phase == Phase::Running) {
                task->running.push_back(i);
            }
        }
        if (task->devices.empty()) {
            std::erase(m_open, task);
            m_tasks.remove({task->id});
            continue;
        }
        refresh(*task, nowMs);
        m_tasks.save(*task);
    }
}

} // namespace emulator
