#pragma once

#include "devices/devicework.h"
#include "http/jsonaccess.h"
#include "tables/database.h"

#include <cstdint>
#include <memory>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace emulator {

class Random;
class Store;
struct Device;

/// The states of tasks and of their devices, without the failure codes.
namespace state {
inline constexpr auto init = "pTaskInitState";
inline constexpr auto queued = "pTaskQueueState";
inline constexpr auto scheduled = "pTaskScheduled";
inline constexpr auto processing = "pTaskProcessing";
inline constexpr auto uploading = "pTaskFileIsUploading";
inline constexpr auto updating = "pTaskDeviceIsUpdating";
inline constexpr auto reconnecting = "pTaskDeviceIsReconnecting";
inline constexpr auto done = "pTaskDone";
inline constexpr auto failed = "pTaskFailed";
inline constexpr auto aborted = "pTaskAborted";

// Failures that have nothing to do with what a device was asked for.
inline constexpr auto noConnection = "pTaskFailedToConnectToDevice";
inline constexpr auto lostConnection = "pTaskFailedToConnectToDeviceEx";
inline constexpr auto mismatch = "pTaskMismatchingStatus"; ///< it is not in the state that the work needs
inline constexpr auto notManaged = "pTaskNotInstalled";
} // namespace state

bool isFinal(const std::string &state);

/// A device of a task.
struct TaskDevice {
    enum class Phase { WithoutWork, Queued, Running, Ended };

    std::string id;
    std::string identity; ///< the beginning of its JSON text: what it was called when the task was made
    std::string state;
    int progress = 0;
    Phase phase = Phase::WithoutWork;

    Json parameters = Json::object(); ///< what the request for the task said of the device

    DeviceWork work; ///< what it has to do, once that is there

    // State of the work; not stored, so it starts again after a restart of the program.
    int step = 0;
    int steps = 0;
    int failsAt = 0;
    std::int64_t dueAt = 0;
};

struct Task {
    std::int64_t row = 0;
    std::string id;
    std::string type;
    std::string user;
    std::string status = state::init;
    std::string state = state::init;
    int progress = 0;
    std::int64_t createdAt = 0;
    std::int64_t updatedAt = 0;
    std::int64_t scheduledAt = 0;    ///< 0 for a task that waits for its work alone
    std::vector<TaskDevice> devices; ///< given up when the task is final
    std::string devicesText;         ///< the devices as they travel; empty when they have changed

    std::int64_t startsAt = 0;
    std::vector<std::size_t> running; ///< indices of the devices that run
};

/// The beginning of a device's entry in a task: a JSON object that is still open.
std::string identityText(const Device &device);
std::string identityText(const std::string &id, const Json &record);
/// Adds a whole entry to the text of an array of them.
void appendEntry(std::string &text, const std::string &identity, const std::string &state, int progress);

/// The tasks, oldest first. Final ones are many and never change, so their text is all that is kept of them.
class TaskTable {
public:
    explicit TaskTable(Store &store);

    std::size_t size() const { return m_tasks.size(); }
    /// Null where there is none.
    Task *find(const std::string &id) const;
    /// The task of an id; throws Refusal(UnknownId).
    Task &get(const std::string &id) const;
    std::vector<Task *> open() const;

    /// Takes a task in, with an id that none has or had.
    Task &add(Task task);
    void save(Task &task);
    void remove(const std::unordered_set<std::string> &ids);

    static std::string text(Task &task);
    /// Newest first.
    std::string pageText(Page page) const;

    /// Shows another progress for the newest tasks, until the next start; gives how many they are.
    std::size_t touch(std::size_t count);

private:
    Store &m_store;
    Statement m_save;
    Statement m_remove;
    std::vector<std::unique_ptr<Task>> m_tasks;
    std::unordered_map<std::string, Task *> m_byId;
    std::int64_t m_lastRow;
};

/// The types of tasks that the service has.
const std::vector<std::string> &taskTypes();

/// One of the codes in which work on a device fails.
std::string failureCode(Random &random);

} // namespace emulator
