#include "devices/operations/firmware/firmwarehistory.h"

#include "tasks/service/tasktype.h"

namespace FirmwareHistory {

QSet<QString> lastFailed(const TaskList &tasks, const QSet<QString> &deviceIds) {
    QSet<QString> open = deviceIds;
    QSet<QString> failed;
    for (const TaskRecordPtr &task : tasks.records()) {
        if (task->type != TaskType::firmwareUpload)
            continue;
        if (open.isEmpty())
            break;
        for (const TaskDevice &device : task->devices) {
            if (open.remove(device.target->id) && task->hasFailedOn(device))
                failed.insert(device.target->id);
        }
    }
    return failed;
}

} // namespace FirmwareHistory
