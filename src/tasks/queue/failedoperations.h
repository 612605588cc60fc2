#pragma once

#include "store/localstore.h"
#include "tasks/queue/failedsubmission.h"

#include <QObject>

#include <deque>
#include <functional>
#include <vector>

class TaskList;

/// The operations that failed before they had begun, or of which nobody knows whether they have, each until
/// the user has answered it. Those of a session that the service has ended are told after the next log-in of
/// the same account on the same server. User-interface thread.
class FailedOperations : public QObject {
    Q_OBJECT

public:
    struct Entry {
        FailedSubmission failure;
        std::function<void()> startAgain; ///< empty where it cannot, or must not, be started again
        std::function<void()> dismissed;  ///< called when the user does not want it any more; may be empty
    };

    static FailedOperations &instance();

    /// login: the session in which it failed. What a log-off of the user has ended is not told.
    void report(const LoginInfo &login, Entry entry);
    /// The devices of a task are seen to elsewhere.
    void forget(const QString &tid);

    /// The one that is told at the moment; null for none.
    const Entry *first() const { return m_entries.empty() ? nullptr : &m_entries.front().entry; }
    int count() const { return static_cast<int>(m_entries.size()); }
    void startFirstAgain();
    void dismissFirst();

signals:
    void changed();
    /// There is another one.
    void told(const QString &message);

private:
    FailedOperations();

    struct Kept {
        QString owner; ///< server and account
        quint64 generation;
        Entry entry;
    };

    void add(Kept kept);
    Entry takeFirst();
    void onSessionEnded();
    void onTaskListUpdated();
    void dropDecided(const TaskList &tasks);

    std::deque<Kept> m_entries;
    std::vector<Kept> m_leftBehind; ///< of sessions that the service has ended
};
