#pragma once

#include "api/session/nettask.h"
#include "tasks/queue/pendingexports.h"
#include "tasks/service/taskrecord.h"

#include <QObject>

#include <memory>
#include <mutex>

class ServiceSession;
class Transfer;

/// What is left to be done when tasks of this client have ended: collects the debug information that devices
/// have exported into report files.
///
/// It goes on after a restart of the program. Every report is collected once and overwrites nothing. The
/// signals come in the user-interface thread.
class CPostWork : public QObject {
    Q_OBJECT

public:
    static CPostWork &instance();

    /// The export of a task is to be collected into the folder. Blocks for the store: for a runner's thread.
    void expectExport(const LoginInfo &login, const QString &tid, const QString &folder);

    /// Collects the exports that have ended, unless that is under way. User-interface thread.
    void SyncExportDebugInfo();

signals:
    /// A report is there, whole.
    void exported(const QString &path);
    /// A report could not be collected, told once for each: a sentence that says what happens now.
    void exportFailed(const QString &message);

private:
    CPostWork();

    void collectAll(ServiceSession &session);
    bool isToCollect(const PendingExport &pending, const TaskRecordPtr &task, bool newList);
    void collect(ServiceSession &session, const PendingExport &pending, const TaskRecord &task);
    void succeed(const PendingExport &pending, const QString &path);
    void fail(const PendingExport &pending, const QString &reason);
    void tellFailure(const QString &message);
    void setTransfer(std::shared_ptr<Transfer> transfer);
    void cancel();

    PendingExports m_pending;
    TaskListPtr m_lastList; ///< of the last collection; the runner's own
    std::mutex m_mutex;     ///< for the transfer
    std::shared_ptr<Transfer> m_transfer;
    NetTask m_runner{NetTask::Turn::Beside}; ///< last: its job uses the others until it has ended
};
