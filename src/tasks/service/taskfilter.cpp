#include "tasks/service/taskfilter.h"

#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"

#include <algorithm>
#include <unordered_map>

namespace {

/// Finds a text in tasks. Devices and states come up in many tasks, so each is looked at once.
class Searcher {
public:
    explicit Searcher(const QString &search) : m_search(search) {}

    bool finds(const TaskRecord &task) {
        return has(TaskType::title(task.type)) || has(task.user) || findsState(task.state) ||
               std::any_of(task.devices.begin(), task.devices.end(), [this](const TaskDevice &device) {
                   return findsTarget(*device.target) || findsState(device.state);
               });
    }

private:
    bool has(const QString &text) const { return text.contains(m_search, Qt::CaseInsensitive); }

    bool findsTarget(const TaskTarget &target) {
        const auto [entry, isNew] = m_targets.try_emplace(&target, false);
        if (isNew)
            entry->second = has(target.model) || has(target.ip) || has(target.mac);
        return entry->second;
    }

    bool findsState(const QString &state) {
        const auto [entry, isNew] = m_states.try_emplace(state, false);
        if (isNew)
            entry->second = has(TaskState::text(state));
        return entry->second;
    }

    const QString &m_search;
    std::unordered_map<const TaskTarget *, bool> m_targets;
    std::unordered_map<QString, bool> m_states;
};

bool isOfKind(const TaskRecord &task, TaskFilter::Kind kind) {
    switch (kind) {
    case TaskFilter::Kind::Active:
        return !task.isFinal();
    case TaskFilter::Kind::Failed:
        return task.isFailed();
    case TaskFilter::Kind::All:
        break;
    }
    return true;
}

} // namespace

std::vector<TaskRecordPtr> TaskFilter::apply(const TaskList &tasks) const {
    if (kind == Kind::All && search.isEmpty())
        return tasks.records();
    Searcher searcher(search);
    std::vector<TaskRecordPtr> passed;
    std::copy_if(tasks.records().begin(), tasks.records().end(), std::back_inserter(passed),
                 [&](const TaskRecordPtr &task) {
                     return isOfKind(*task, kind) && (search.isEmpty() || searcher.finds(*task));
                 });
    return passed;
}
