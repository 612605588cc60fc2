#pragma once

#include "api/session/nettask.h"
#include "api/session/pagereader.h"
#include "tasks/service/alarmrecord.h"
#include "tasks/service/taskrecord.h"

#include <QObject>

#include <atomic>
#include <mutex>

class ServiceSession;

/// What the service tells of its tasks and its alarms: the latest copy of both lists, and their polls.
///
/// The lists are snapshots that nobody changes; readers share them. The signals come in the user-interface
/// thread. A poll that fails leaves the lists as they were.
class CTaskInfoPool : public QObject {
    Q_OBJECT

public:
    static CTaskInfoPool &instance();

    /// Begins to fetch the task list, unless a fetch is under way. User-interface thread.
    void loadTaskStatuses();
    /// The same for the alarm list.
    void loadAlarmInfo();

    /// Fetches the task list at once, for a job that has made a task and wants it to be seen. Waits for
    /// another fetch of this kind that is under way, but for one request of a poll only, which then gives up:
    /// the job may hold the turn of all requests. False when it has thrown, which is logged.
    bool fetchTaskStatuses(ServiceSession &session);

    /// Writes a task's final state on the service. Blocks for a request: for a runner's thread.
    unsigned updateTaskState(ServiceSession &session, const QString &tid, const QString &state);

    TaskListPtr taskList() const;
    AlarmListPtr alarmInfo() const;
    /// How many alarms the service has, which may be more than the list holds.
    int alarmTotal() const { return m_alarmTotal; }
    bool isAlarmListLoaded() const { return m_alarmListLoaded; }
    bool isTaskListLoaded() const { return m_taskListLoaded; }

    /// True once a fetch has found a task that is new or further than before, until it is cleared.
    bool isTasksChanged() const { return m_tasksChanged; }
    void clearTasksChanged() { m_tasksChanged = false; }

    /// True while a task is at work or waits for its time.
    bool hasRunningTask() const;
    /// True while a task has been asked for and not begun.
    bool hasRequestedTask() const;

    /// Forgets everything: the session has ended.
    void clear();

signals:
    /// A fetch has succeeded.
    void taskListUpdated();
    void alarmListUpdated();
    /// A fetch has failed; the lists are as they were.
    void taskListFailed();
    void alarmListFailed();
    void cleared();

private:
    CTaskInfoPool();

    void startPostWork();
    /// Ends without a list when it may not go on between its pages.
    void readTasks(ServiceSession &session, const PageReader::GoOn &goOn);
    void readAlarms(ServiceSession &session);
    bool takeTasks(const ServiceSession &session, TaskListPtr tasks, bool changed);
    void tell(const ServiceSession &session, void (CTaskInfoPool::*signal)());

    NetTask m_taskRunner;
    NetTask m_alarmRunner;

    std::mutex m_fetch; ///< held for a whole fetch of tasks, so that an older list never replaces a newer one
    std::atomic<int> m_waiting = 0; ///< fetches at once that wait for m_fetch
    TaskParser m_parser;

    mutable std::mutex m_mutex; ///< for the two lists, which are swapped under it with what is told of them
    TaskListPtr m_tasks;
    AlarmListPtr m_alarms;
    std::atomic<int> m_alarmTotal = 0;
    std::atomic<bool> m_alarmListLoaded = false;
    std::atomic<bool> m_taskListLoaded = false;
    std::atomic<bool> m_tasksChanged = false;
};
