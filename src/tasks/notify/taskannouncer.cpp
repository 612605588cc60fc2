#include "tasks/notify/taskannouncer.h"

#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"

#include <QCoreApplication>

namespace {

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(TaskAnnouncer)
};

bool isEnd(const QString &state) {
    return state == TaskState::done || state == TaskState::failed || state == TaskState::uploadDone;
}

/// The message of a step, or nothing for most. A failed task is told like a successful one: the panel says
/// which.
QString message(const QString &type, const QString &state) {
    if (type == TaskType::firmwareUpload) {
        if (state == TaskState::scheduled)
            return Texts::tr("Task - Upload Firmware created");
        if (state == TaskState::processing)
            return Texts::tr("Task - Upload Firmware processing");
        return isEnd(state) ? Texts::tr("Task - Upload Firmware finished") : QString();
    }
    if (type == TaskType::configFileUpload) {
        if (state == TaskState::processing)
            return Texts::tr("Task - Upload Configuration File processing");
        return isEnd(state) ? Texts::tr("Task - Upload Configuration File finished") : QString();
    }
    if (type == TaskType::packageUpload) {
        if (state == TaskState::processing)
            return Texts::tr("Task - Upload Package File processing");
        return isEnd(state) ? Texts::tr("Task - Upload Package File finished") : QString();
    }
    return {};
}

} // namespace

std::vector<TaskAnnouncer::Announcement> TaskAnnouncer::follow(const TaskList &tasks) {
    std::vector<Announcement> announcements;
    const bool first = m_round++ == 0;
    for (const TaskRecordPtr &task : tasks.records()) {
        Seen &seen = m_seen[task->tid];
        seen.round = m_round;
        if (seen.state == task->state)
            continue;
        seen.state = task->state;
        if (const QString text = first ? QString() : message(task->type, task->state); !text.isEmpty())
            announcements.push_back({text, task->tid});
    }
    m_seen.removeIf(
        [this](const auto &entry) { return entry.value().round + listsWithoutAGoneTask <= m_round; });
    return announcements;
}

void TaskAnnouncer::reset() {
    m_seen.clear();
    m_round = 0;
}
