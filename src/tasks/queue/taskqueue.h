#pragma once

#include "api/session/nettask.h"
#include "store/localstore.h"
#include "tasks/queue/failedsubmission.h"
#include "tasks/queue/queuedrecords.h"
#include "tasks/queue/servicetask.h"
#include "tasks/queue/taskkind.h"

#include <QObject>
#include <QSet>

#include <atomic>
#include <functional>
#include <memory>
#include <mutex>
#include <span>

class QTimer;
class Transfer;

/// A queue of long operations. Windows insert records and may close at once; a worker thread takes the
/// records in their order, one at a time, makes a task on the service for each and does its work. How a task
/// goes on from there shows in the service's list.
///
/// Records stay for as long as the process lives, so that their operations can be repeated; their passwords
/// do not. A record is worked on once, in the session in which it was inserted. User-interface thread unless
/// a function says otherwise; the signals come there.
class TaskQueue : public QObject {
    Q_OBJECT

public:
    /// Called on the worker's thread when a record has had its turn; error 0 means success.
    using Completion = std::function<void(quintptr context, quint32 error)>;

    ~TaskQueue() override;

    void setCompletionCallback(quintptr context, Completion completion);

    /// The worker's body: works on every queued record, those that come meanwhile too. Blocks.
    void handlingTask();

    /// True while a record is at work or waits for it.
    bool isBusy() const { return m_records.hasPending() || m_worker.isRunning(); }

    /// Does the work of a failed record again, as a new record.
    void startAgain(const QString &ctid);
    /// Whoever inserted a record sees to what becomes of it, or does so no longer: nobody else offers to
    /// start it again meanwhile.
    void setFollowed(const QString &ctid, bool followed);
    /// A failed record will not be started again.
    void dismiss(const QString &ctid);

    /// What a record sends at the moment.
    struct Sending {
        QString name;                       ///< of the file, or of the operation where there are several
        std::shared_ptr<Transfer> transfer; ///< null while no record is at work
        QString tid;                        ///< of the service task, once it is made
    };
    Sending sending() const;

    /// Empty where there is no such record. Any thread.
    QString stateOf(const QString &ctid) const;

signals:
    /// The record's task is on the service; tid is its id there.
    void serviceTaskMade(const QString &ctid, const QString &tid);
    void handOverFailed(const FailedSubmission &failure);
    /// A record's task was made without those of its devices that the service has no more.
    void devicesLeftOut(const QString &ctid, int count);
    /// A record can only be repeated with a password or a key that is not kept: whoever can ask for it opens
    /// that dialog for the devices.
    void dialogNeeded(const QString &serviceType, const QStringList &deviceIds);

protected:
    /// families: the types of records; has to outlive the queue. iterationError: begins the line that is
    /// logged when the list cannot be walked.
    TaskQueue(std::span<const TaskKind> families, const char *iterationError);

    /// Completes a record (id, type, state) and appends it. ctid: takes its id where it is not null. False,
    /// and a line logged, for a type that the queue does not know or a state that is no text. Any thread.
    bool insert(const char *type, JSON record, QString *ctid = nullptr);

private:
    void onTimeout();
    void onSessionEnded();
    void onTaskListUpdated();
    void onQuit();

    const TaskKind *familyOf(std::string_view type) const;
    void runStep(const TaskKind &family, JSON &record);
    ServiceTask::Outcome perform(const TaskKind &family, TaskContext &step, JSON &record);
    void onTaskMade(const TaskKind &family, TaskContext &step, const ServiceTask::Outcome &made);
    unsigned work(const TaskKind &family, TaskContext &step);
    void finish(const TaskKind &family, const TaskContext &step, const ServiceTask::Outcome &outcome);
    void startTimer();
    void complete(quint32 error);
    void setSending(Sending sending);
    void cancelSending();
    void abandonOtherSessions(const TaskKind &family, const JSON &record);
    void report(const LoginInfo &login, FailedSubmission failure);
    bool setState(const TaskKind &family, const JSON &record, const char *state);
    RetryRegistry::Repeat retryOf(const TaskKind &family, const QString &ctid, const QString &tid);
    void repeat(const QString &ctid, const QString &tid, const QStringList &deviceIds);
    void insertAgain(const TaskKind &family, JSON record);
    template <typename Told>
    void tell(const TaskContext &step, Told told);

    std::span<const TaskKind> m_families;
    const char *m_walkError;

    QueuedRecords m_records;

    mutable std::mutex m_mutex; ///< for the completion callback and what is sent
    Completion m_completion;
    quintptr m_completionContext = 0;
    Sending m_sending;

    QTimer *m_timer;
    QSet<QString> m_followed; ///< records that somebody sees to
    bool m_ticking = false;
    std::atomic<bool> m_stopping = false;
    NetTask m_worker{NetTask::Turn::Beside}; ///< last: its job uses the others until it has ended
};
