#include "tasks/taskengine.h"

#include "http/response.h"
#include "simulation/random.h"
#include "tables/devicetable.h"
#include "tables/logtable.h"
#include "tables/settings.h"
#include "tables/store.h"
#include "tables/tasktable.h"
#include "tasks/taskrequest.h"

#include <algorithm>
#include <array>
#include <optional>
#include <utility>

namespace emulator {

namespace {

using Phase = TaskDevice::Phase;

constexpr std::size_t maxParallel = 20;
constexpr int minSteps = 6;
constexpr int outageStep = 2;
constexpr int outageSteps = 3;

[[noreturn]] void refuse(const std::string &why) {
    throw Refusal(Code::Malformed, why);
}

bool isRestart(const std::string &type) {
    return type == "deviceRestart" || type == "deviceRestore";
}

bool isFirmware(const Task &task) {
    return task.type == "deviceFWUpgrade";
}

/// The state of a device that is at work.
const char *runningState(const Task &task, const TaskDevice &device) {
    static constexpr std::array phases = {state::uploading, state::updating, state::reconnecting};
    if (!isFirmware(task) || device.step == 0)
        return state::processing;
    return phases[static_cast<std::size_t>(device.step) * phases.size() /
                  static_cast<std::size_t>(device.steps)];
}

std::optional<std::size_t> nextQueued(const Task &task) {
    for (std::size_t i = 0; i < task.devices.size(); ++i)
        if (task.devices[i].phase == Phase::Queued)
            return i;
    return std::nullopt;
}

bool any(const Task &task, Phase phase) {
    return std::any_of(task.devices.begin(), task.devices.end(),
                       [&](const TaskDevice &device) { return device.phase == phase; });
}

int meanProgress(const Task &task) {
    std::size_t sum = 0;
    for (const TaskDevice &device : task.devices)
        sum += static_cast<std::size_t>(device.progress);
    return static_cast<int>(sum / std::max<std::size_t>(task.devices.size(), 1));
}

/// The state of a task of which some devices run.
std::string shownState(const Task &task) {
    const std::string first = task.devices[*std::min_element(task.running.begin(), task.running.end())].state;
    // A device that follows another one does not begin the task a second time.
    const bool again = isFirmware(task) && first == state::processing && any(task, Phase::Ended);
    return again ? state::uploading : first;
}

} // namespace

TaskEngine::TaskEngine(Store &store, TaskTable &tasks, DeviceTable &devices, const Settings &settings,
                       LogTable &log)
    : m_store(store),
      m_tasks(tasks),
      m_devices(devices),
      m_settings(settings),
      m_log(log),
      m_outages(devices),
      m_open(tasks.open()) {}

Task &TaskEngine::create(const std::string &type, const std::string &user, const Json &devices,
                         std::int64_t nowMs) {
    Task task = requestedTask(type, devices, m_devices, nowMs);
    task.user = user;
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
    std::unordered_set<std::string> gone;
    for (const TaskDevice &device : task.devices)
        if (device.phase == Phase::WithoutWork)
            waiting.insert(device.id);
        else if (device.phase == Phase::Ended && !m_devices.find(device.id))
            gone.insert(device.id);
    if (work.empty())
        refuse("the work names no device");
    for (const DeviceWork &item : work)
        if (waiting.erase(item.id) == 0 && !gone.contains(item.id))
            refuse("device " + item.id + " waits for no work under this task");
}

void TaskEngine::startWork(const std::string &taskId, const std::vector<DeviceWork> &work,
                           std::int64_t nowMs) {
    judgeWork(taskId, work);
    Task &task = m_tasks.get(taskId);
    std::unordered_map<std::string, const DeviceWork *> items;
    for (const DeviceWork &item : work)
        items[item.id] = &item;
    for (TaskDevice &device : task.devices) {
        const auto found = items.find(device.id);
        if (found == items.end() || device.phase != Phase::WithoutWork)
            continue;
        device.phase = Phase::Queued;
        device.state = task.status == state::scheduled ? state::scheduled : state::queued;
        device.work = *found->second;
        device.work.restarts = device.work.restarts || isRestart(task.type);
    }
    // Devices are seen to queue before the first of them are taken.
    task.startsAt = nowMs + m_rules.paceMs;
    refresh(task, nowMs);
    m_tasks.save(task);
}

void TaskEngine::endArrival(const std::string &taskId) {
    if (const auto found = m_arriving.find(taskId); found != m_arriving.end() && --found->second == 0)
        m_arriving.erase(found);
}

void TaskEngine::close(const std::string &taskId, const std::string &finalState, std::int64_t nowMs) {
    Task &task = m_tasks.get(taskId);
    if (!isFinal(finalState) || isFinal(task.status))
        refuse("the task cannot become " + finalState);
    for (TaskDevice &device : task.devices)
        if (device.phase != Phase::Ended)
            end(task, device, finalState);
    task.progress = meanProgress(task);
    finish(task, finalState, nowMs);
}

void TaskEngine::remove(const std::unordered_set<std::string> &taskIds) {
    for (const std::string &id : taskIds)
        if (!isFinal(m_tasks.get(id).status))
            refuse("task " + id + " has not ended");
    m_tasks.remove(taskIds);
}

void TaskEngine::settle(std::int64_t nowMs) {
    if (!m_open.empty()) {
        Transaction transaction(m_store.database());
        // A task that ends leaves the list.
        for (Task *task : std::vector<Task *>(m_open))
            settleTask(*task, nowMs);
        transaction.commit();
    }
    m_outages.endDue(nowMs);
}

void TaskEngine::settleTask(Task &task, std::int64_t nowMs) {
    const bool wakes = task.status == state::scheduled && nowMs >= task.scheduledAt;
    if (wakes)
        wake(task, nowMs);
    bool changed = dropOverdue(task, nowMs) || wakes;
    if (task.status != state::scheduled && nowMs >= task.startsAt)
        changed = run(task, nowMs) || changed;
    if (changed)
        refresh(task, nowMs);
}

void TaskEngine::wake(Task &task, std::int64_t nowMs) {
    task.status = state::init;
    task.startsAt = nowMs;
    for (TaskDevice &device : task.devices) {
        device.state = device.phase == Phase::Ended    ? device.state
                       : device.phase == Phase::Queued ? state::queued
                                                       : state::init;
    }
}

/// Work that never comes is given up; a scheduled task may have it as late as at its time.
bool TaskEngine::dropOverdue(Task &task, std::int64_t nowMs) const {
    const std::int64_t due = std::max(task.createdAt, task.scheduledAt) + m_rules.workTimeoutMs;
    if (nowMs < due || m_arriving.contains(task.id))
        return false;
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
    bool changed = fillSlots(task, nowMs);
    for (std::size_t index = 0; index < task.running.size();) {
        TaskDevice &device = task.devices[task.running[index]];
        if (device.dueAt > nowMs) {
            ++index;
            continue;
        }
        changed = true;
        advance(task, device);
        const bool hasSlot = device.phase == Phase::Ended && task.running.size() <= slotsOf(task);
        const auto next = hasSlot ? nextQueued(task) : std::nullopt;
        if (device.phase != Phase::Ended) {
            device.dueAt += m_rules.paceMs;
        } else if (next) {
            task.running[index] = *next;
            begin(task, *next, device.dueAt);
        } else {
            task.running.erase(task.running.begin() + static_cast<std::ptrdiff_t>(index));
        }
    }
    return changed;
}

/// How many devices of a task may run at a time; the settings bound those that get firmware, of all tasks.
std::size_t TaskEngine::slotsOf(const Task &task) const {
    const std::size_t limit = isFirmware(task) ? m_settings.firmwareLimit() : 0;
    if (limit == 0)
        return maxParallel;
    std::size_t elsewhere = 0;
    for (const Task *open : m_open)
        elsewhere += open != &task && isFirmware(*open) ? open->running.size() : 0;
    return std::min(maxParallel, limit - std::min(limit, elsewhere));
}

bool TaskEngine::fillSlots(Task &task, std::int64_t nowMs) {
    bool filled = false;
    while (task.running.size() < slotsOf(task)) {
        const auto next = nextQueued(task);
        if (!next)
            break;
        task.running.push_back(*next);
        begin(task, *next, nowMs);
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
    device.steps = minSteps + static_cast<int>(random.below(3));
    device.failsAt = 1 + static_cast<int>(random.below(static_cast<std::uint64_t>(device.steps)));
    if (random.chance(m_rules.failures) && device.work.failure.empty())
        device.work.failure = failureCode(random);
    device.dueAt = nowMs + m_rules.paceMs;
    if (Device *target = m_devices.find(device.id))
        target->action = task.type;
}

void TaskEngine::advance(const Task &task, TaskDevice &device) {
    Device &target = m_devices.get(device.id);
    ++device.step;
    m_outages.endOf(device.id, device.dueAt);
    if (!target.reachable && !m_outages.has(device.id))
        return end(task, device, device.step > 1 ? state::lostConnection : state::noConnection);
    if (device.step == 1 && !isPermitted(target, device.work.access))
        return end(task, device, state::mismatch);
    if (!device.work.failure.empty() && device.step >= device.failsAt)
        return end(task, device, device.work.failure);
    if (device.step == device.steps)
        return succeed(task, device);
    if (device.work.restarts && device.step == outageStep)
        m_outages.begin(target, {}, device.dueAt + outageSteps * m_rules.paceMs);
    device.state = runningState(task, device);
    device.progress = device.step * 100 / device.steps;
}

void TaskEngine::succeed(const Task &task, TaskDevice &device) {
    apply(m_devices, m_devices.get(device.id), device.work);
    device.progress = 100;
    end(task, device, state::done);
}

void TaskEngine::end(const Task &task, TaskDevice &device, const std::string &finalState) {
    Device *target = device.phase == Phase::Running ? m_devices.find(device.id) : nullptr;
    if (target && target->action == task.type)
        target->action = standby;
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
        device.action = action;
        m_outages.begin(device, action, nowMs + outageSteps * m_rules.paceMs);
    }
}

void TaskEngine::forget(const std::unordered_set<std::string> &deviceIds, std::int64_t nowMs) {
    const auto isGone = [&](const TaskDevice &device) {
        return deviceIds.contains(device.id) || !m_devices.find(device.id);
    };
    for (Task *task : std::vector<Task *>(m_open)) {
        bool touched = false;
        for (TaskDevice &device : task->devices) {
            if (device.phase != Phase::Ended && deviceIds.contains(device.id)) {
                end(*task, device, state::notManaged);
                touched = true;
            }
        }
        if (!touched)
            continue;
        std::erase_if(task->running, [&](std::size_t i) { return task->devices[i].phase == Phase::Ended; });
        if (std::all_of(task->devices.begin(), task->devices.end(), isGone)) {
            std::erase(m_open, task);
            m_tasks.remove({task->id});
            continue;
        }
        refresh(*task, nowMs);
        m_tasks.save(*task);
    }
}

} // namespace emulator
