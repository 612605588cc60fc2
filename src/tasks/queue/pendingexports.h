#pragma once

#include "platform/json.h"
#include "store/localstore.h"

#include <atomic>
#include <chrono>
#include <mutex>
#include <vector>

/// An export of debug information that this client has asked for and not collected yet.
struct PendingExport {
    QString tid;
    QString server; ///< address and port of the service that works on it
    QString account;
    QString folder;     ///< where its report goes
    qint64 askedAt = 0; ///< Unix ms
    QString target;     ///< the report that is being fetched; empty for none

    bool isSame(const PendingExport &other) const { return tid == other.tid && server == other.server; }
};

/// The exports that are waited for. They are kept in the local store, so that they outlive the program. Their
/// reading blocks: for a runner's thread.
class PendingExports {
public:
    using Clock = std::chrono::steady_clock;

    /// How a session's service stands in an export.
    static QString serverOf(const LoginInfo &login);

    /// Notes an export, durably when it returns. The oldest ones give way when nobody has collected very many
    /// of them.
    void add(PendingExport pending);
    void remove(const PendingExport &pending);

    /// Notes the file that is about to be fetched, durably when it returns: one that is there after a crash
    /// is whole then. An empty one when it was not fetched.
    void setTarget(const PendingExport &pending, const QString &target);

    /// Those of the session that are not kept back at the moment.
    std::vector<PendingExport> due(const LoginInfo &login, Clock::time_point now);

    /// Keeps one back after a failure, every time for longer. True for the first time.
    bool postpone(const PendingExport &pending, Clock::time_point now);

    /// Notes whether a new list of tasks has it. True when it lacks it for no accident any more.
    bool isLost(const PendingExport &pending, bool listed);

    /// True when there are none. False until they were read. Any thread.
    bool isEmpty() const { return m_empty; }

private:
    struct Entry {
        PendingExport pending;
        int failures = 0;
        int lacking = 0; ///< lists in a row
        Clock::time_point next{};
    };

    void load();
    void save();
    Entry *find(const PendingExport &pending);

    std::mutex m_mutex;
    std::vector<Entry> m_entries;
    bool m_loaded = false;
    std::atomic<bool> m_empty = false;
};
