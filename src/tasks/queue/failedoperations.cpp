#include "tasks/queue/failedoperations.h"

#include "api/session/sessionevents.h"
#include "tasks/queue/pendingexports.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/taskstate.h"

#include <algorithm>
#include <utility>

namespace {

QString ownerOf(const LoginInfo &login) {
    return PendingExports::serverOf(login) + QLatin1Char('\n') + login.account;
}

/// True once a task shows by itself how it goes on.
bool isDecided(const TaskRecord &task) {
    return task.isFinal() || task.status == TaskState::processing || task.status == TaskState::scheduled;
}

} // namespace

FailedOperations &FailedOperations::instance() {
    // Never destroyed, as the queues that report to it.
    static auto *const operations = new FailedOperations;
    return *operations;
}

FailedOperations::FailedOperations() {
    auto &pool = CTaskInfoPool::instance();
    connect(&pool, &CTaskInfoPool::cleared, this, &FailedOperations::onSessionEnded);
    connect(&pool, &CTaskInfoPool::taskListUpdated, this, &FailedOperations::onTaskListUpdated);
}

void FailedOperations::report(const LoginInfo &login, Entry entry) {
    Kept kept{ownerOf(login), login.generation, std::move(entry)};
    if (SessionEvents::instance().wasLost(login.generation))
        m_leftBehind.push_back(std::move(kept));
    else if (CLocalStore::instance().loginInfo().generation == login.generation)
        add(std::move(kept));
}

void FailedOperations::add(Kept kept) {
    const QString message = kept.entry.failure.text();
    m_entries.push_back(std::move(kept));
    emit changed();
    emit told(message);
}

void FailedOperations::forget(const QString &tid) {
    const auto isOfTask = [&tid](const Kept &each) { return each.entry.failure.tid == tid; };
    if (!tid.isEmpty() && std::erase_if(m_entries, isOfTask) > 0)
        emit changed();
}

FailedOperations::Entry FailedOperations::takeFirst() {
    Entry entry = std::move(m_entries.front().entry);
    m_entries.pop_front();
    emit changed();
    return entry;
}

void FailedOperations::startFirstAgain() {
    if (!first() || !first()->startAgain)
        return;
    const Entry entry = takeFirst();
    // Its empty task fails some time, and must not offer the same once more.
    RetryRegistry::instance().take(entry.failure.tid);
    entry.startAgain();
}

void FailedOperations::dismissFirst() {
    if (!first())
        return;
    const Entry entry = takeFirst();
    if (entry.dismissed)
        entry.dismissed();
}

void FailedOperations::onSessionEnded() {
    for (Kept &each : m_entries) {
        if (SessionEvents::instance().wasLost(each.generation))
            m_leftBehind.push_back(std::move(each));
    }
    m_entries.clear();
    emit changed();
}

void FailedOperations::onTaskListUpdated() {
    const LoginInfo login = CLocalStore::instance().loginInfo();
    const auto isOthers = [owner = ownerOf(login)](const Kept &each) { return each.owner != owner; };
    const auto mine = std::stable_partition(m_leftBehind.begin(), m_leftBehind.end(), isOthers);
    std::vector<Kept> back(std::make_move_iterator(mine), std::make_move_iterator(m_leftBehind.end()));
    m_leftBehind.erase(mine, m_leftBehind.end());
    for (Kept &each : back) {
        each.generation = login.generation;
        add(std::move(each));
    }
    dropDecided(*CTaskInfoPool::instance().taskList());
}

void FailedOperations::dropDecided(const TaskList &tasks) {
    const auto isOver = [&tasks](const Kept &each) {
        const FailedSubmission &failure = each.entry.failure;
        const TaskRecordPtr task = failure.mayHaveBegun ? tasks.find(failure.tid) : nullptr;
        return task && isDecided(*task);
    };
    if (std::erase_if(m_entries, isOver) > 0)
        emit changed();
}
