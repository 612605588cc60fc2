#pragma once

#include "task_table.h"

#include <cstdint>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace emulator {

class DeviceTable;
class LogTable;
class Random;

/// How tasks run.
struct TaskRules {
    std::int64_t paceMs = 1000;
    std::int64_t workTimeoutMs = 120000;
    double failures = 0; ///< the share of devices that fail by chance
    std::uint64_t seed = 0;
};

/// The work of a task for one of its devices.
struct DeviceWork {
    std::string id;
    Json changes = Json::object(); ///< members of the device's record when the work succeeds
    bool restarts = false;         ///< the device is away for a moment while it works
    std::string failure;           ///< a code in which the work is bound to end; empty for none
};

const std::vector<std::string> &taskTypes();

/// One of the codes in which work on a device fails.
std::string failureCode(Random &random);

/// Makes tasks and runs them, twenty devices at a time in each. Time passes with settle.
class TaskEngine {
public:
    TaskEngine(Store &store, TaskTable &tasks, DeviceTable &devices, LogTable &log);

    TaskRules &rules() { return m_rules; }

    /// A task on devices, named by their ids or by objects that hold an "id" and parameters; a parameter
    /// "actm" schedules the task. Throws Refusal for an unknown type or device and where no device is named.
    Task &create(const std::string &type, const std::string &user, const Json &devices, std::int64_t nowMs);

    /// Throws Refusal when the task is unknown or cannot take this work.
    void judgeWork(const std::string &taskId, const std::vector<DeviceWork> &work) const;
    /// Lets a task run, at once or at its time. Throws what judgeWork throws.
    void startWork(const std::string &taskId, const std::vector<DeviceWork> &work, std::int64_t nowMs);

    /// Ends a task, and what its devices still do, in a final state. Throws Refusal for a task that is final
    /// or unknown and for a state that is not final.
    void close(const std::string &taskId, const std::string &finalState, std::int64_t nowMs);
    /// Drops tasks; throws Refusal, and drops none, when one is unknown or not final.
    void remove(const std::unordered_set<std::string> &taskIds);

    /// Does everything that has fallen due.
    void settle(std::int64_t nowMs);

    /// Restarts a device for nobody's task.
    void restart(Device &device, const std::string &action, std::int64_t nowMs);

    /// Takes devices that are to go out of the tasks that are not final.
    void forget(const std::unordered_set<std::string> &deviceIds, std::int64_t nowMs);

private:
    struct Outage {
        std::int64_t endsAt = 0;
        std::string action; ///< what ends with the outage; empty for none
    };

    void endOutages(std::int64_t nowMs);
    void endOutage(const std::string &deviceId, const Outage &outage);
    void settleTask(Task &task, std::int64_t nowMs);
    static void wake(Task &task, std::int64_t nowMs);
    bool dropOverdue(Task &task, std::int64_t nowMs) const;
    bool run(Task &task, std::int64_t nowMs);
    bool fillPlaces(Task &task);
    void begin(Task &task, std::size_t index, std::int64_t nowMs);
    void advance(const Task &task, TaskDevice &device);
    void succeed(const Task &task, TaskDevice &device);
    void end(const Task &task, TaskDevice &device, const std::string &finalState);
    void refresh(Task &task, std::int64_t nowMs);
    void finish(Task &task, const std::string &finalState, std::int64_t nowMs);

    Store &m_store;
    TaskTable &m_tasks;
    DeviceTable &m_devices;
    LogTable &m_log;
    TaskRules m_rules;
    std::vector<Task *> m_open;
    std::unordered_map<std::string, Outage> m_outages;
};

} // namespace emulator
