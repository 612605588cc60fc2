#pragma once

#include "tasks/service/taskrecord.h"

#include <QString>

/// Which tasks the panel shows.
struct TaskFilter {
    enum class Kind { All, Active, Failed };

    Kind kind = Kind::All;
    QString search; ///< to be found in title, user or state of the task, or in a device of it; empty for none

    bool operator==(const TaskFilter &) const = default;

    /// The tasks that pass, in their order. Any thread; with a search it looks at every device of every task.
    std::vector<TaskRecordPtr> apply(const TaskList &tasks) const;
};
