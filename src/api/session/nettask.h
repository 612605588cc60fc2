#pragma once

#include <QThread>

#include <functional>
#include <memory>

/// Runs one blocking job on a thread of its own, one job of the whole process at a time.
///
/// Set up with a job and started, from the user-interface thread; a long-lived runner takes the next job when
/// its thread is not running. Jobs wait at most 30 s for their turn and are dropped after that. Those of a
/// runner for readings let what a user does go first, also between the pages of a list, so that a click waits
/// for one request of theirs at most. A runner outside the lock does not wait: it is for the polls of tasks
/// and alarms, for transfers, and for work that sends no requests.
class NetTask : public QThread {
    Q_OBJECT

public:
    using Job = std::function<void(quintptr context)>;
    using Preparation = std::function<void()>;
    enum class Turn { Wait, Reading, Beside };

    /// Lets a runner go without waiting for it: one that still runs deletes itself when it has finished.
    struct DeleteWhenFinished {
        void operator()(NetTask *runner) const;
    };
    /// How a window owns a runner: the window may close while a job runs.
    using Owner = std::unique_ptr<NetTask, DeleteWhenFinished>;

    explicit NetTask(Turn turn = Turn::Wait);
    ~NetTask() override;

    /// Stores the job in place of any earlier one, and what to do before the job waits for its turn: name
    /// look-ups belong there. Only while the thread is not running.
    void setUp(quintptr context, Job job, Preparation preparation = {});

    /// Waits for every runner of the process, at most the given time altogether. False when some still run.
    static bool waitForAll(int milliseconds);

    /// Runs a function on a thread with a runner's stack and waits for it, beside the jobs' turn.
    static void runAndWait(const std::function<void()> &function);

protected:
    void run() override;

private:
    void runJob();

    Turn m_turn;
    quintptr m_context = 0;
    Job m_job;
    Preparation m_preparation;
};
