#include "taskrepeats.h"

#include "taskrecord.h"

TaskRepeats &TaskRepeats::instance() {
    static TaskRepeats repeats;
    return repeats;
}

void TaskRepeats::remember(const QString &tid, Repeat repeat) {
    m_repeats.insert(tid, std::move(repeat));
}

const TaskRepeats::Repeat *TaskRepeats::find(const QString &tid) const {
    const auto found = m_repeats.find(tid);
    return found == m_repeats.end() ? nullptr : &*found;
}

void TaskRepeats::keepOnly(const TaskList &tasks) {
    m_repeats.removeIf([&](const auto &entry) { return !tasks.find(entry.key()); });
}
