#include "taskrepeats.h"

#include "taskrecord.h"

TaskRepeats &TaskRepeats::instance() {
    static TaskRepeats repeats;
    return repeats;
}

void TaskRepeats::remember(const QString &tid, Repeat repeat) {
    m_entries.insert(tid, {std::move(repeat)});
}

const TaskRepeats::Repeat *TaskRepeats::find(const QString &tid) const {
    const auto found = m_entries.constFind(tid);
    return found == m_entries.cend() || isTaken(tid) ? nullptr : &found->repeat;
}

void TaskRepeats::take(const QString &tid) {
    if (const auto found = m_entries.find(tid); found != m_entries.end())
        found->isTaken = true;
}

bool TaskRepeats::isTaken(const QString &tid) const {
    const auto found = m_entries.constFind(tid);
    return (found != m_entries.cend() && found->isTaken) || (m_guard && m_guard(tid));
}

void TaskRepeats::follow(const TaskList &tasks) {
    m_entries.removeIf([&](auto each) {
        Entry &entry = each.value();
        entry.lacking = tasks.find(each.key()) ? 0 : entry.lacking + 1;
        return entry.lacking >= listsWithoutAGoneTask;
    });
}
