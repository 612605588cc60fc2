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
    return found == m_entries.cend() ? nullptr : &found->repeat;
}

void TaskRepeats::follow(const TaskList &tasks) {
    m_entries.removeIf([&](auto each) {
        Entry &entry = each.value();
        entry.lacking = tasks.find(each.key()) ? 0 : entry.lacking + 1;
        return entry.lacking >= listsWithoutAGoneTask;
    });
}
