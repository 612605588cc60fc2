#pragma once

#include "devices/operations/rollout/rolloutplan.h"
#include "tasks/service/taskrecord.h"

#include <QObject>

#include <functional>

/// Firmware for a first group of devices, and for the rest only when that went well enough.
///
/// It has no clock, no list and no requests of its own: whoever owns it hands these over, calls advance()
/// when time has passed or the list is another one, and tells what became of an upload. An upload that it
/// asks for is answered by onQueued() or onNotBegun(), at once or later. User-interface thread.
class Rollout : public QObject {
    Q_OBJECT

public:
    enum class State { FirstWave, Waiting, SecondWave, Stopped, Done };
    enum class Reason {
        None,
        User,
        TooManyFailed, ///< in the first wave
        Cancelled,     ///< the task of the wave was
        TaskGone,      ///< removed from the list before it was over
        NotBegun       ///< the wave did not get to the service; the progress has the text of it
    };

    /// One of the two uploads.
    struct Wave {
        QStringList deviceIds;
        QString ctid;            ///< of the record in the queue
        QString tid;             ///< of the task on the service
        QStringList earlierTids; ///< the tasks for the same devices that were in the list before it
        bool isSeen = false;
        qint64 scheduledAt = 0; ///< Unix ms, 0 where it does not wait for its time
        int done = 0;
        int failed = 0;

        int total() const { return static_cast<int>(deviceIds.size()); }
        int finished() const { return done + failed; }
    };

    /// How far it is: all that a rollout is beside its plan.
    struct Progress {
        State state = State::FirstWave;
        State stoppedIn = State::FirstWave;
        Reason reason = Reason::None;
        QString reasonText;
        Wave wave;           ///< the present one, or the last one
        int earlierDone = 0; ///< devices that waves before this one have brought to an end
        int earlierFailed = 0;
        qint64 waitUntil =
            0; ///< Unix ms, for the next run of the program: this one waits by its steady clock
    };

    struct Environment {
        std::function<qint64()> now;    ///< Unix ms: for what is kept over a restart of the program
        std::function<qint64()> steady; ///< ms that pass whatever is done to the machine's clock
        std::function<TaskListPtr()> tasks;
        /// actionTime: Unix ms as text, empty for now.
        std::function<void(Rollout &, const QStringList &deviceIds, const QString &actionTime)> upload;
    };

    Rollout(RolloutPlanPtr plan, Environment surroundings, QObject *parent = nullptr);

    void begin();
    /// Goes on from where an earlier session has left it.
    void resume(const Progress &progress);
    void advance();

    void onQueued(const QString &ctid);
    void onNotBegun(const QString &reason);
    void onServiceTaskMade(const QString &ctid, const QString &tid);
    void onHandOverFailed(const QString &ctid, const QString &reason);

    void stop();
    /// Does not wait any longer, or goes on after a stop: with the wave that did not come to its end, else
    /// with the next one. Devices that may have been reached are not sent the image again.
    void goOn();
    /// True while it may send the present wave again: nobody else should then.
    bool mayRepeatWave() const;

    bool canStop() const;
    bool canGoOn() const;
    /// True when nothing is left that would be decided.
    bool canBeDismissed() const;
    bool isRunning() const;

    const RolloutPlan &plan() const { return *m_plan; }
    const RolloutPlanPtr &planPtr() const { return m_plan; }
    const Progress &progress() const { return m_progress; }
    State state() const { return m_progress.state; }
    /// How long the wait between the waves still takes, in ms.
    qint64 waitLeft() const;

signals:
    /// It is in another state, or knows the task of its wave now: time to keep its progress.
    void moved();
    /// Figures are different.
    void counted();

private:
    void beginWave(State state, const QStringList &deviceIds);
    void follow();
    bool isTaskGone(const TaskListPtr &tasks, const TaskRecordPtr &task);
    void count(const TaskRecord &task);
    void onWaveEnded(const TaskRecord &task);
    void judgeFirstWave();
    void leaveWave(State wave);
    void repeatWave(State wave);
    bool isUploading() const;
    QStringList tasksFor(const QStringList &deviceIds) const;
    void halt(Reason reason, const QString &text = {});
    void setState(State state);

    RolloutPlanPtr m_plan;
    Environment m_surroundings;
    Progress m_progress;
    TaskRecordPtr m_counted; ///< what the figures were taken from
    TaskListPtr m_followed;  ///< the last list that was looked at
    qint64 m_waitEnd = 0;    ///< on the steady clock
    int m_missedPolls = 0;   ///< lists in a row without the wave's task
};
