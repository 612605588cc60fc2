#include "tasks/queue/taskmaker.h"

#include "api/session/servicesession.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/tasktargets.h"

#include <QSet>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace TaskMaker {

namespace {

bool isFor(const TaskRecord &task, const QSet<QString> &ids) {
    return static_cast<qsizetype>(task.devices.size()) == ids.size() &&
           std::all_of(task.devices.begin(), task.devices.end(),
                       [&](const TaskDevice &device) { return ids.contains(device.target->id); });
}

/// The task of the list that came since the earlier one and fits; empty unless there is exactly one.
std::string newTask(const TaskList &earlier, const ServiceSession &session, const char *serviceType,
                    const JSON &devices) {
    const QStringList texts = TaskTargets::idTexts(devices);
    const QSet<QString> ids(texts.begin(), texts.end());
    const QString type = QString::fromLatin1(serviceType);
    std::string found;
    for (const TaskRecordPtr &task : CTaskInfoPool::instance().taskList()->records()) {
        if (task->type != type || task->user != session.login().account || earlier.find(task->tid) ||
            task->isFinal() || !isFor(*task, ids))
            continue;
        if (!found.empty())
            return {};
        found = task->tid.toStdString();
    }
    return found;
}

} // namespace

unsigned make(ServiceSession &session, const char *serviceType, const JSON &devices, std::string &tid) {
    auto &pool = CTaskInfoPool::instance();
    const TaskListPtr earlier = pool.isTaskListLoaded() ? pool.taskList() : nullptr;
    JSON task;
    const unsigned result =
        session.call([&](CApiClient &client) { return client.newTaskState(serviceType, devices, task); });
    tid = result == ApiOk ? textMember(task, "tid") : "";
    if (result == ApiOk)
        return tid.empty() ? unsigned{ApiMissingData} : result;
    if (!session.isUnanswered() || !earlier)
        return result;
    pool.fetchTaskStatuses(session);
    tid = newTask(*earlier, session, serviceType, devices);
    return tid.empty() ? result : unsigned{ApiOk};
}

} // namespace TaskMaker
