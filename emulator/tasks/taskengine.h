#pragma once

#include "devices/devicework.h"
#include "tables/tasktable.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace emulator {

class DeviceTable;
class LogTable;
class Settings;

/// How tasks run.
struct TaskRules {
    std::int64_t paceMs = 1000;
    std::int64_t workTimeoutMs = 120000;
    double failures = 0; ///< the share of devices that fail by chance
    std::uint64_t seed = 0;
};

/// Makes tasks and runs them, twenty devices at a time in each. Time passes with settle.
class TaskEngine {
public:
    TaskEngine(Store &store, TaskTable &tasks, DeviceTable &devices, const Settings &settings, LogTable &log);

    TaskRules &rules() { return m_rules; }

    /// A task as requestedTask makes it; throws what that throws.
    Task &create(const std::string &type, const std::string &user, const Json &devices, std::int64_t nowMs);

    /// Throws Refusal when the task is unknown or cannot take this work.
    void judgeWork(const std::string &taskId, const std::vector<DeviceWork> &work) const;
    /// Lets a task run, at once or at its time. Throws what judgeWork throws.
    void startWork(const std::string &taskId, const std::vector<DeviceWork> &work, std::int64_t nowMs);

    /// Work for a task arrives: until all of it has, the task does not count as one whose work never came.
    void beginArrival(const std::string &taskId) { ++m_arriving[taskId]; }
    void endArrival(const std::string &taskId);

    /// Ends a task, and what its devices still do, in a final state. Throws Refusal for a task that is final
    /// or unknown and for a state that is not final.
    void close(const std::string &taskId, const std::string &finalState, std::int64_t nowMs);
    /// Drops tasks; throws Refusal, and drops none, when one is unknown or not final.
    void remove(const std::unordered_set<std::string> &taskIds);

    /// Does everything that has fallen due.
    void settle(std::int64_t nowMs);

    /// Restarts a device without a task.
    void restart(Device &device, const std::string &action, std::int64_t nowMs);

    /// Ends what devices that are to go still do. Tasks without any other device go with them.
    void forget(const std::unordered_set<std::string> &deviceIds, std::int64_t nowMs);

private:
    void settleTask(Task &task, std::int64_t nowMs);
    static void wake(Task &task, std::int64_t nowMs);
    bool dropOverdue(Task &task, std::int64_t nowMs) const;
    bool run(Task &task, std::int64_t nowMs);
    std::size_t slotsOf(const Task &task) const;
    bool fillSlots(Task &task, std::int64_t nowMs);
    void begin(Task &task, std::size_t index, std::int64_t nowMs);
    void advance(const Task &task, TaskDevice &device);
    void succeed(const Task &task, TaskDevice &device);
    void end(const Task &task, TaskDevice &device, const std::string &finalState);
    void refresh(Task &task, std::int64_t nowMs);
    void finish(Task &task, const std::string &finalState, std::int64_t nowMs);

    Store &m_store;
    TaskTable &m_tasks;
    DeviceTable &m_devices;
    const Settings &m_settings;
    LogTable &m_log;
    TaskRules m_rules;
    DeviceOutages m_outages;
    std::vector<Task *> m_open;
    std::unordered_map<std::string, int> m_arriving;
};

} // namespace emulator
