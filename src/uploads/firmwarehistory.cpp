#include "firmwarehistory.h"

#include "taskstate.h"
#include "tasktype.h"

namespace FirmwareHistory {

namespace {

/// A task may fail as a whole before it has come to some of its devices.
bool hasFailed(const TaskRecord &task, const TaskDevice &device) {
    return TaskState::isFailure(device.state) ||
           (task.isFinal() && task.status == TaskState::failed && !TaskState::isFinal(device.state));
}

} // namespace

QSet<QString> lastFailed(const TaskList &tasks, const QSet<QString> &deviceIds) {
    QSet<QString> open = deviceIds;
    QSet<QString> failed;
    for (const TaskRecordPtr &task : tasks.records()) {
        if (task->type != TaskType::firmwareUpload)
            continue;
        if (open.isEmpty())
            break;
        for (const TaskDevice &device : task->devices) {
            if (open.remove(device.target->id) && hasFailed(*task, device))
                failed.insert(device.target->id);
        }
    }
    return failed;
}

} // namespace FirmwareHistory
