#include "tasks/service/taskinfopool.h"

#include "api/session/servicerequest.h"
#include "platform/log/messagelog.h"
#include "tasks/queue/postwork.h"
#include "tasks/service/taskstate.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <limits>

namespace {

constexpr int taskPageSize = 300;
constexpr int alarmLimit = 1000;

/// True when a task is new or further than in the previous list. An empty list on either side tells nothing.
bool differs(const TaskList &tasks, const TaskList &previous) {
    if (tasks.isEmpty() || std::none_of(previous.records().begin(), previous.records().end(),
                                        [](const TaskRecordPtr &task) { return task->comparable; }))
        return false;
    return std::any_of(tasks.records().begin(), tasks.records().end(), [&](const TaskRecordPtr &task) {
        const TaskRecordPtr before = previous.find(task->tid);
        if (before == task)
            return false;
        return !before || !before->comparable || before->state != task->state ||
               before->progressText != task->progressText;
    });
}

void logTasks(const TaskList &tasks, const TaskList &previous) {
    for (const TaskRecordPtr &task : tasks.records()) {
        if (previous.find(task->tid) == task || (previous.isEmpty() && !task->active))
            continue;
        qDebug("## Task status: %s", qUtf8Printable(task->status));
        qDebug("## Task action: %s", qUtf8Printable(task->type));
        qDebug("## Task strStateStatus: %s", qUtf8Printable(task->state));
    }
}

/// The total as a number of 32 bits; the JSON library's type error for a value that is no number.
int totalOf(const JSON &value) {
    constexpr int most = std::numeric_limits<int>::max();
    if (value.is_number_float())
        return static_cast<int>(std::clamp(value.get<double>(), 0.0, double{most}));
    return static_cast<int>(std::clamp<std::int64_t>(value.get<std::int64_t>(), 0, most));
}

/// Runs the body of a fetch; nothing that it throws leaves the thread. False when it has thrown.
bool guarded(const std::function<void()> &body) {
    try {
        body();
        return true;
    } catch (const std::exception &error) {
        qWarning("Handling task status loading occurs error: %s", error.what());
    } catch (...) {
        qWarning("Handling task status loading occurs error: Unknown exception");
    }
    return false;
}

} // namespace

CTaskInfoPool &CTaskInfoPool::instance() {
    // Never destroyed: a fetch may still run when the program ends.
    static auto *const pool = new CTaskInfoPool;
    return *pool;
}

CTaskInfoPool::CTaskInfoPool()
    : m_taskRunner(NetTask::Turn::Beside),
      m_alarmRunner(NetTask::Turn::Beside),
      m_tasks(std::make_shared<TaskList>()),
      m_alarms(std::make_shared<AlarmList>()) {}

void CTaskInfoPool::loadTaskStatuses() {
    ServiceRequest::post(&m_taskRunner, this,
                         [this](ServiceSession &session) {
                             const MessageLog::PollScope counted;
                             const std::lock_guard fetch(m_fetch);
                             if (guarded([&] { readTasks(session, [this] { return m_waiting == 0; }); }))
                                 startPostWork();
                             return true;
                         },
                         {});
}

void CTaskInfoPool::loadAlarmInfo() {
    ServiceRequest::post(&m_alarmRunner, this,
                         [this](ServiceSession &session) {
                             const MessageLog::PollScope counted;
                             guarded([&] { readAlarms(session); });
                             return true;
                         },
                         {});
}

bool CTaskInfoPool::fetchTaskStatuses(ServiceSession &session) {
    ++m_waiting;
    const std::lock_guard fetch(m_fetch);
    --m_waiting;
    return guarded([&] { readTasks(session, [] { return true; }); });
}

void CTaskInfoPool::startPostWork() {
    QMetaObject::invokeMethod(
        this, [] { CPostWork::instance().SyncExportDebugInfo(); }, Qt::QueuedConnection);
}

void CTaskInfoPool::readTasks(ServiceSession &session, const PageReader::GoOn &goOn) {
    const TaskListPtr previous = taskList();
    std::vector<TaskRecordPtr> records;
    int unreadable = 0;
    const unsigned result = PageReader::readAll(
        session, &CApiClient::listTaskStatus, taskPageSize,
        [&](JSON &page) {
            for (const JSON &value : page) {
                if (TaskRecordPtr record = m_parser.parse(value, *previous))
                    records.push_back(std::move(record));
                else
                    ++unreadable;
            }
        },
        goOn);
    if (result == ApiOk && !goOn())
        return;
    if (result != ApiOk) {
        qDebug("HTTP API(listTaskStatus) failed! (%u)", result);
        return tell(session, &CTaskInfoPool::taskListFailed);
    }
    if (unreadable > 0)
        qWarning("%d task records have no id and were left out", unreadable);
    // Nothing but garbage is no list, and certainly no empty one.
    if (unreadable > 0 && records.empty())
        return tell(session, &CTaskInfoPool::taskListFailed);
    const auto tasks = std::make_shared<const TaskList>(std::move(records));
    if (!takeTasks(session, tasks, differs(*tasks, *previous)))
        return;
    logTasks(*tasks, *previous);
    m_parser.forgetUnused();
    tell(session, &CTaskInfoPool::taskListUpdated);
}

/// False when the session has ended meanwhile: its tasks are nobody's then.
bool CTaskInfoPool::takeTasks(const ServiceSession &session, TaskListPtr tasks, bool changed) {
    const std::lock_guard lock(m_mutex);
    if (!session.isPresent())
        return false;
    m_tasks = std::move(tasks);
    m_taskListLoaded = true;
    if (changed)
        m_tasksChanged = true;
    return true;
}

void CTaskInfoPool::readAlarms(ServiceSession &session) {
    const LoginInfo &login = session.login();
    qDebug("%s > Loading login info ip: %s, port: %d, account: %s, token: %s",
           "CTaskInfoPool::loadAlarmInfoList", qUtf8Printable(login.address), static_cast<int>(login.port),
           qUtf8Printable(login.account), MessageLog::secret(login.token).constData());
    JSON answer;
    const unsigned result =
        session.call([&](CApiClient &client) { return client.listAlarmInfo(0, alarmLimit, answer); });
    if (result != ApiOk) {
        qWarning("HTTP API(loadAlarmInfoList) failed! (%u)", result);
        return tell(session, &CTaskInfoPool::alarmListFailed);
    }
    try {
        auto alarms = std::make_shared<const AlarmList>(AlarmRecords::parse(answer.at("items")));
        const std::lock_guard lock(m_mutex);
        if (!session.isPresent())
            return;
        m_alarms = std::move(alarms);
        m_alarmTotal = totalOf(answer.at("total_items"));
        m_alarmListLoaded = true;
    } catch (...) {
        tell(session, &CTaskInfoPool::alarmListFailed);
        throw;
    }
    tell(session, &CTaskInfoPool::alarmListUpdated);
}

unsigned CTaskInfoPool::updateTaskState(ServiceSession &session, const QString &tid, const QString &state) {
    unsigned result = ApiException;
    try {
        result = session.call([&](CApiClient &client) {
            return client.updateTaskState(tid.toUtf8().constData(), state.toUtf8().constData());
        });
        if (result != ApiOk)
            qWarning("HTTP API(updateTaskState) failed! (%u)", result);
    } catch (const std::exception &error) {
        qWarning("Encountered unexpected error when updating task state: %s", error.what());
    }
    return result;
}

/// Fetches end on their own threads; who listens lives in the user-interface thread. There the session may
/// end before its turn comes, and the lists are those of no session then.
void CTaskInfoPool::tell(const ServiceSession &session, void (CTaskInfoPool::*signal)()) {
    const auto emitOwn = [this, signal, generation = session.login().generation] {
        if (CLocalStore::instance().loginInfo().generation == generation)
            (this->*signal)();
    };
    QMetaObject::invokeMethod(this, emitOwn, Qt::QueuedConnection);
}

TaskListPtr CTaskInfoPool::taskList() const {
    const std::lock_guard lock(m_mutex);
    return m_tasks;
}

AlarmListPtr CTaskInfoPool::alarmInfo() const {
    const std::lock_guard lock(m_mutex);
    return m_alarms;
}

bool CTaskInfoPool::hasRunningTask() const {
    const TaskListPtr tasks = taskList();
    return std::any_of(tasks->records().begin(), tasks->records().end(), [](const TaskRecordPtr &task) {
        return task->active &&
               (task->status == TaskState::processing || task->status == TaskState::scheduled);
    });
}

bool CTaskInfoPool::hasRequestedTask() const {
    const TaskListPtr tasks = taskList();
    return std::any_of(tasks->records().begin(), tasks->records().end(),
                       [](const TaskRecordPtr &task) { return task->state == TaskState::init; });
}

void CTaskInfoPool::clear() {
    {
        const std::lock_guard lock(m_mutex);
        m_tasks = std::make_shared<TaskList>();
        m_alarms = std::make_shared<AlarmList>();
        m_alarmTotal = 0;
        m_alarmListLoaded = false;
        m_taskListLoaded = false;
        m_tasksChanged = false;
    }
    emit cleared();
}
