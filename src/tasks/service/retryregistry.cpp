#include "tasks/service/retryregistry.h"

#include "tasks/service/taskrecord.h"

RetryRegistry &RetryRegistry::instance() {
    static RetryRegistry repeats;
    return repeats;
}

void RetryRegistry::remember(const QString &tid, Repeat repeat) {
    m_entries.insert(tid, {std::move(repeat)});
}

const RetryRegistry::Repeat *RetryRegistry::find(const QString &tid) const {
    const auto found = m_entries.constFind(tid);
    return found == m_entries.cend() || isTaken(tid) ? nullptr : &found->repeat;
}

void RetryRegistry::take(const QString &tid) {
    if (const auto found = m_entries.find(tid); found != m_entries.end())
        found->isTaken = true;
}

bool RetryRegistry::isTaken(const QString &tid) const {
    const auto found = m_entries.constFind(tid);
    return (found != m_entries.cend() && found->isTaken) || (m_guard && m_guard(tid));
}

void RetryRegistry::follow(const TaskList &tasks) {
    m_entries.removeIf([&](auto each) {
        Entry &entry = each.value();
        entry.lacking = tasks.find(each.key()) ? 0 : entry.lacking + 1;
        return entry.lacking >= listsWithoutAGoneTask;
    });
}
