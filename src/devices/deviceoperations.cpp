#include "deviceoperations.h"

#include "servicesession.h"
#include "taskinfopool.h"
#include "tasktype.h"

#include <nlohmann/json.hpp>

namespace DeviceOperations {

namespace {

/// Makes a task for the devices and shows it in the task list before its work begins.
Outcome makeTask(ServiceSession &session, const QString &type, const JSON &devices) {
    JSON task;
    const unsigned result = session.call(
        [&](CApiClient &client) { return client.newTaskState(type.toUtf8().constData(), devices, task); });
    const QString tid = result == ApiOk ? stringMember(task, "tid") : QString();
    if (result == ApiOk && tid.isEmpty())
        return {ApiMissingData, {}};
    if (result == ApiOk)
        CTaskInfoPool::instance().fetchTaskStatuses(session);
    return {result, tid};
}

/// Runs commands on devices under a task of their own.
Outcome runCommands(ServiceSession &session, const QString &type, const QStringList &deviceIds,
                    const JSON &commands) {
    JSON ids = JSON::array();
    for (const QString &id : deviceIds)
        ids.push_back(id.toStdString());
    Outcome outcome = makeTask(session, type, ids);
    if (outcome.result != ApiOk)
        return outcome;
    JSON targets = JSON::array();
    for (const JSON &id : ids)
        targets.push_back({{"id", id}, {"tid", outcome.tid.toStdString()}});
    JSON answers;
    outcome.result =
        session.call([&](CApiClient &client) { return client.runCustomCgisEx(commands, targets, answers); });
    return outcome;
}

} // namespace

Outcome restart(ServiceSession &session, const QStringList &deviceIds) {
    return runCommands(session, TaskType::restart, deviceIds,
                       JSON::array({"/cgi-bin/admin/setparam.cgi?system_reset=0"}));
}

} // namespace DeviceOperations
