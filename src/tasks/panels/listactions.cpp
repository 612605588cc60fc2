#include "tasks/panels/listactions.h"

#include "api/session/jobendtext.h"
#include "api/session/servicerequest.h"
#include "tasks/service/alarmrecord.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/taskstate.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

/// A request names that many at most.
constexpr qsizetype idsPerRequest = 1000;
/// Alarms may come as fast as they are removed; then it ends all the same.
constexpr int maxAlarmPages = 20;

/// A call that removes what is named, with its name for the log.
struct RemoveCall {
    const char *name;
    unsigned (CApiClient::*method)(const JSON &);
};
constexpr RemoveCall removeTaskStatus = {"removeTaskStatus", &CApiClient::removeTaskStatus};
constexpr RemoveCall removeAlarmInfo = {"removeAlarmInfo", &CApiClient::removeAlarmInfo};

/// Logs a failure; the result again.
unsigned logged(const char *method, unsigned result) {
    if (result != ApiOk)
        qWarning("HTTP API(%s) failed! (%u)", method, result);
    return result;
}

JSON idArray(const QStringList &ids) {
    JSON array = JSON::array();
    for (const QString &id : ids)
        array.push_back(id.toStdString());
    return array;
}

unsigned removeInParts(ServiceSession &session, RemoveCall remove, const QStringList &ids) {
    for (qsizetype first = 0; first < ids.size(); first += idsPerRequest) {
        const JSON part = idArray(ids.mid(first, idsPerRequest));
        const unsigned result = logged(
            remove.name, session.call([&](CApiClient &client) { return (client.*remove.method)(part); }));
        if (result != ApiOk)
            return result;
    }
    return ApiOk;
}

/// One task that is gone already makes the service refuse them all; then those that are left go without it.
unsigned removeTasksOf(ServiceSession &session, const QStringList &tids) {
    const unsigned result = removeInParts(session, removeTaskStatus, tids);
    if (result != ApiServerError)
        return result;
    CTaskInfoPool &pool = CTaskInfoPool::instance();
    pool.fetchTaskStatuses(session);
    QStringList left;
    for (const QString &tid : tids) {
        if (pool.taskList()->find(tid))
            left += tid;
    }
    return left.size() < tids.size() ? removeInParts(session, removeTaskStatus, left) : result;
}

unsigned cancelTasksOf(ServiceSession &session, const QStringList &tids) {
    unsigned worst = ApiOk;
    for (const QString &tid : tids) {
        const unsigned result = CTaskInfoPool::instance().updateTaskState(session, tid, TaskState::aborted);
        worst = result == ApiOk ? worst : result;
    }
    return worst;
}

unsigned removeAlarmPages(ServiceSession &session) {
    for (int page = 0; page < maxAlarmPages; ++page) {
        JSON answer;
        unsigned result = logged("listAlarmInfo", session.call([&](CApiClient &client) {
            return client.listAlarmInfo(0, static_cast<int>(idsPerRequest), answer);
        }));
        if (result != ApiOk)
            return result;
        QStringList ids;
        for (const AlarmRecord &alarm : AlarmRecords::parse(answer.value("items", JSON::array())))
            ids += alarm.alid;
        if (ids.isEmpty())
            break;
        result = removeInParts(session, removeAlarmInfo, ids);
        if (result != ApiOk)
            return result;
    }
    return ApiOk;
}

} // namespace

ListActions::ListActions(QObject *parent) : QObject(parent), m_runner(new NetTask) {}

ListActions::~ListActions() = default;

void ListActions::cancelTasks(const QStringList &tids) {
    run([tids](ServiceSession &session) { return cancelTasksOf(session, tids); },
        [] { CTaskInfoPool::instance().loadTaskStatuses(); }, tr("The task could not be cancelled: %1."));
}

void ListActions::removeTasks(const QStringList &tids) {
    run([tids](ServiceSession &session) { return removeTasksOf(session, tids); },
        [] { CTaskInfoPool::instance().loadTaskStatuses(); }, tr("The tasks could not be removed: %1."));
}

void ListActions::removeAlarms(const QStringList &alids) {
    run([alids](ServiceSession &session) { return removeInParts(session, removeAlarmInfo, alids); },
        [] { CTaskInfoPool::instance().loadAlarmInfo(); }, tr("The alarms could not be deleted: %1."));
}

void ListActions::removeAllAlarms() {
    run(
        &removeAlarmPages, [] { CTaskInfoPool::instance().loadAlarmInfo(); },
        tr("The alarms could not be deleted: %1."));
}

void ListActions::run(std::function<unsigned(ServiceSession &)> action, std::function<void()> reload,
                      const QString &failure) {
    if (m_busy)
        return;
    m_busy = ServiceRequest::post(
        m_runner.get(), this, std::move(action),
        [this, failure](unsigned result) {
            if (result != ApiOk)
                emit failed(failure.arg(apiResultText(result)));
        },
        [this, reload = std::move(reload), failure](JobOutcome end) {
            m_busy = false;
            emit busyChanged(false);
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                emit failed(failure.arg(jobEndText(end)));
            if (end != JobOutcome::SessionGone)
                reload();
        });
    if (m_busy)
        emit busyChanged(true);
}
