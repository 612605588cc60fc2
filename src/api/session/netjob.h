#pragma once

#include "api/session/nettask.h"

#include <QObject>

#include <functional>
#include <memory>
#include <optional>
#include <type_traits>

/// How a job ended, told exactly once for every job unless its receiver is gone.
enum class JobOutcome {
    Delivered,  ///< its result was handed over
    NotRun,     ///< it never got its turn
    Failed,     ///< it threw; the exception was logged
    SessionGone ///< its session ended meanwhile; the result belongs to nobody
};

/// Carries a job to a runner and its result home.
///
/// Called in the user-interface thread. The work runs on the runner's thread and must not touch widgets; the
/// two handlers run in the receiver's thread, or not at all when the receiver has been destroyed: first done
/// with the result (not when there is none), then ended. Whatever the receiver marked as busy it releases in
/// ended, which also comes when the job was dropped or has failed.
namespace NetJob {

using Ended = std::function<void(JobOutcome)>;

/// Whether a result may still be handed over, asked right before.
using StillWanted = std::function<bool()>;

/// A runner that deletes itself when it has finished, or null: then a line with the purpose is logged.
NetTask *createRunner(const char *purpose, NetTask::Turn turn = NetTask::Turn::Wait);

/// Starts the job and calls finished in the receiver's thread when the runner has ended. False, with nothing
/// started, when the runner is null or still busy.
bool start(NetTask *runner, QObject *receiver, std::function<void()> job, std::function<void()> finished,
           NetTask::Preparation preparation);

template <typename Work, typename Result = std::invoke_result_t<Work>>
bool post(NetTask *runner, QObject *receiver, Work work,
          std::type_identity_t<std::function<void(Result)>> done, Ended ended = {},
          NetTask::Preparation preparation = {}, StillWanted stillWanted = {}) {
    struct State {
        bool started = false;
        std::optional<Result> result;
    };
    auto state = std::make_shared<State>();
    auto job = [state, work = std::move(work)]() mutable {
        state->started = true;
        state->result.emplace(work());
    };
    auto finished = [state, done = std::move(done), ended = std::move(ended),
                     stillWanted = std::move(stillWanted)] {
        JobOutcome end = state->result    ? JobOutcome::Delivered
                         : state->started ? JobOutcome::Failed
                                          : JobOutcome::NotRun;
        if (stillWanted && !stillWanted())
            end = JobOutcome::SessionGone;
        // A handler may destroy the receiver, so what the second one needs is its own.
        if (end == JobOutcome::Delivered && done)
            done(std::move(*state->result));
        if (ended)
            ended(end);
    };
    return start(runner, receiver, std::move(job), std::move(finished), std::move(preparation));
}

} // namespace NetJob
