#pragma once

#include "tasks/service/taskrecord.h"

#include <QHash>

/// Decides which steps of tasks are worth a message on the desktop.
class TaskAnnouncer {
public:
    struct Announcement {
        QString text;
        QString tid;
    };

    /// Compares a list with the one before. The first list announces nothing.
    std::vector<Announcement> follow(const TaskList &tasks);

    /// The next list is a first one again.
    void reset();

private:
    struct Seen {
        QString state;
        quint64 round = 0;
    };

    QHash<QString, Seen> m_seen;
    quint64 m_round = 0;
};
