#pragma once

#include <QHash>
#include <QStringList>

#include <functional>

class TaskList;

/// What this client knows of the tasks that it has started: how to do the same for other devices. For tasks
/// of other clients, and of earlier runs, it knows nothing. User-interface thread.
class RetryRegistry {
public:
    struct Repeat {
        /// Does it again, for the devices with these ids.
        std::function<void(const QStringList &deviceIds)> again;
        /// It had a password or a key, which is not kept: again opens the dialog that asks for it.
        bool needsInput = false;
    };

    static RetryRegistry &instance();

    void remember(const QString &tid, Repeat repeat);
    /// It is done again already: nobody is offered the same once more.
    void take(const QString &tid);
    /// Tells of tasks that somebody else may do again; those are not offered either.
    void setGuard(std::function<bool(const QString &tid)> guard) { m_guard = std::move(guard); }
    /// True when it was taken, or is guarded.
    bool isTaken(const QString &tid) const;
    /// Null for a task whose parameters are not known here, and for one that is taken.
    const Repeat *find(const QString &tid) const;
    /// Takes a new list in, and forgets the tasks that the service has no more.
    void follow(const TaskList &tasks);
    void clear() { m_entries.clear(); }

private:
    struct Entry {
        Repeat repeat;
        bool isTaken = false;
        int lacking = 0; ///< lists in a row
    };

    QHash<QString, Entry> m_entries;
    std::function<bool(const QString &)> m_guard;
};
