#include "devices/operations/rollout/rollout.h"

#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"

#include <QSet>

#include <algorithm>
#include <utility>

namespace {

constexpr qint64 minuteMs = 60 * 1000;

bool isServed(const TaskDevice &device) {
    return TaskState::isFinal(device.state) && !TaskState::isFailure(device.state) &&
           device.state != TaskState::aborted;
}

/// True for a device that a cancelled task has come to and not finished with: it may be updating.
bool isAtWork(const TaskDevice &device) {
    return !TaskState::isFinal(device.state) && device.state != TaskState::init &&
           device.state != TaskState::queued && device.state != TaskState::scheduled;
}

/// The devices of a wave that its task has not served and is not at work on.
QStringList notDone(const Rollout::Wave &wave, const TaskRecord *task) {
    QSet<QString> done;
    if (task) {
        for (const TaskDevice &device : task->devices) {
            if (isServed(device) || isAtWork(device))
                done.insert(device.target->id);
        }
    }
    QStringList left;
    for (const QString &id : wave.deviceIds) {
        if (!done.contains(id))
            left += id;
    }
    return left;
}

} // namespace

Rollout::Rollout(RolloutPlanPtr plan, Environment surroundings, QObject *parent)
    : QObject(parent), m_plan(std::move(plan)), m_surroundings(std::move(surroundings)) {}

void Rollout::begin() {
    beginWave(State::FirstWave, m_plan->firstWave());
}

void Rollout::resume(const Progress &progress) {
    m_progress = progress;
    if (isUploading() && m_progress.wave.tid.isEmpty()) {
        // The program may have ended before it noted the task that it had made.
        QStringList tids = tasksFor(m_progress.wave.deviceIds);
        tids.removeIf([this](const QString &tid) { return m_progress.wave.earlierTids.contains(tid); });
        m_progress.wave.tid = tids.value(0);
        // What the queue of that session held is gone with it.
        if (m_progress.wave.tid.isEmpty())
            return halt(Reason::NotBegun, tr("The session ended before it began."));
        emit moved();
    }
    // A clock that was set back meanwhile must not make it wait for years.
    const qint64 left = m_progress.waitUntil - m_surroundings.now();
    m_waitEnd = m_surroundings.steady() + std::clamp<qint64>(left, 0, m_plan->waitMinutes * minuteMs);
    advance();
}

qint64 Rollout::waitLeft() const {
    return std::max<qint64>(m_waitEnd - m_surroundings.steady(), 0);
}

bool Rollout::isUploading() const {
    return state() == State::FirstWave || state() == State::SecondWave;
}

/// The firmware tasks in the list that are for these devices, or for those of them that are left.
QStringList Rollout::tasksFor(const QStringList &deviceIds) const {
    const QSet<QString> wanted(deviceIds.begin(), deviceIds.end());
    const auto isWanted = [&](const TaskDevice &device) { return wanted.contains(device.target->id); };
    QStringList tids;
    for (const TaskRecordPtr &task : m_surroundings.tasks()->records()) {
        if (task->type == TaskType::firmwareUpload && !task->devices.empty() &&
            std::all_of(task->devices.begin(), task->devices.end(), isWanted))
            tids += task->tid;
    }
    return tids;
}

void Rollout::beginWave(State state, const QStringList &deviceIds) {
    m_progress.earlierDone += m_progress.wave.done;
    m_progress.earlierFailed += m_progress.wave.failed;
    m_progress.wave = {};
    m_progress.wave.deviceIds = deviceIds;
    m_progress.wave.earlierTids = tasksFor(deviceIds);
    setState(state);
    m_surroundings.upload(*this, deviceIds, state == State::FirstWave ? m_plan->actionTime : QString());
}

void Rollout::advance() {
    if (state() == State::Waiting && waitLeft() == 0)
        return beginWave(State::SecondWave, m_plan->rest());
    if (!m_progress.wave.tid.isEmpty())
        follow();
}

void Rollout::onQueued(const QString &ctid) {
    m_progress.wave.ctid = ctid;
}

void Rollout::onNotBegun(const QString &reason) {
    halt(Reason::NotBegun, reason);
}

void Rollout::onServiceTaskMade(const QString &ctid, const QString &tid) {
    if (ctid != m_progress.wave.ctid || ctid.isEmpty())
        return;
    m_progress.wave.tid = tid;
    emit moved();
    advance();
}

void Rollout::onHandOverFailed(const QString &ctid, const QString &reason) {
    if (ctid == m_progress.wave.ctid && !ctid.isEmpty())
        halt(Reason::NotBegun, reason);
}

/// The figures are followed in a stopped rollout too: its devices are at work all the same.
void Rollout::follow() {
    const TaskListPtr tasks = m_surroundings.tasks();
    const TaskRecordPtr task = tasks->find(m_progress.wave.tid);
    const bool isGone = isTaskGone(tasks, task);
    if (task && task != m_counted)
        count(*task);
    m_counted = task;
    if (!isUploading())
        return;
    if (task && task->isFinal())
        return onWaveEnded(*task);
    if (isGone)
        halt(Reason::TaskGone);
}

bool Rollout::isTaskGone(const TaskListPtr &tasks, const TaskRecordPtr &task) {
    const bool isNewList = std::exchange(m_followed, tasks) != tasks;
    if (task || !m_progress.wave.isSeen)
        m_missedPolls = 0;
    else if (isNewList)
        ++m_missedPolls;
    return m_missedPolls >= listsWithoutAGoneTask;
}

void Rollout::count(const TaskRecord &task) {
    Wave &wave = m_progress.wave;
    const auto served = std::count_if(task.devices.begin(), task.devices.end(), &isServed);
    const int done = std::min(static_cast<int>(served), wave.total());
    // What a task that is over has left out will not come any more.
    const bool isOver = task.isFinal() && task.status != TaskState::aborted;
    const int failed = isOver ? wave.total() - done : std::min(task.failedDevices, wave.total() - done);
    const qint64 scheduledAt = task.status == TaskState::scheduled ? task.scheduledAt : 0;
    const bool isSame =
        wave.isSeen && done == wave.done && failed == wave.failed && scheduledAt == wave.scheduledAt;
    wave.isSeen = true;
    wave.done = done;
    wave.failed = failed;
    wave.scheduledAt = scheduledAt;
    if (!isSame)
        emit counted();
}

void Rollout::onWaveEnded(const TaskRecord &task) {
    if (task.status == TaskState::aborted)
        return halt(Reason::Cancelled);
    if (state() == State::FirstWave)
        judgeFirstWave();
    else
        setState(State::Done);
}

void Rollout::judgeFirstWave() {
    if (m_plan->rest().isEmpty())
        return setState(State::Done);
    // The wave may have been the rest of one that was repeated.
    const qint64 failed = m_progress.earlierFailed + m_progress.wave.failed;
    if (failed * 100 > qint64{m_plan->maxFailedPercent} * m_plan->firstWave().size())
        return halt(Reason::TooManyFailed);
    m_progress.waitUntil = m_surroundings.now() + m_plan->waitMinutes * minuteMs;
    m_waitEnd = m_surroundings.steady() + m_plan->waitMinutes * minuteMs;
    setState(State::Waiting);
    advance();
}

void Rollout::halt(Reason reason, const QString &text) {
    if (state() != State::Stopped)
        m_progress.stoppedIn = state();
    m_progress.reason = reason;
    m_progress.reasonText = text;
    setState(State::Stopped);
}

void Rollout::stop() {
    if (canStop())
        halt(Reason::User);
}

void Rollout::goOn() {
    if (!canGoOn())
        return;
    const Reason reason = std::exchange(m_progress.reason, Reason::None);
    const State stoppedIn = m_progress.stoppedIn;
    if (state() == State::Waiting || reason == Reason::TooManyFailed)
        return beginWave(State::SecondWave, m_plan->rest());
    if (reason == Reason::User) {
        setState(stoppedIn);
        return advance();
    }
    if (reason == Reason::TaskGone)
        return leaveWave(stoppedIn);
    repeatWave(stoppedIn);
}

/// Nobody can tell any more whom the wave has reached, so it is not sent again.
void Rollout::leaveWave(State wave) {
    if (wave == State::FirstWave && !m_plan->rest().isEmpty())
        return beginWave(State::SecondWave, m_plan->rest());
    setState(State::Done);
}

bool Rollout::mayRepeatWave() const {
    return isUploading() || (state() == State::Stopped && (m_progress.reason == Reason::Cancelled ||
                                                           m_progress.reason == Reason::NotBegun));
}

void Rollout::repeatWave(State wave) {
    const TaskRecordPtr task = m_surroundings.tasks()->find(m_progress.wave.tid);
    const QStringList left = notDone(m_progress.wave, task.get());
    if (left.isEmpty()) {
        setState(wave);
        return wave == State::FirstWave ? judgeFirstWave() : setState(State::Done);
    }
    // They are tried once more, and nobody knows of a lost task whom it has served.
    m_progress.wave.failed = 0;
    m_progress.wave.done = m_progress.wave.total() - static_cast<int>(left.size());
    beginWave(wave, left);
}

bool Rollout::canStop() const {
    return state() == State::FirstWave || state() == State::Waiting;
}

bool Rollout::canGoOn() const {
    return state() == State::Waiting || state() == State::Stopped;
}

bool Rollout::canBeDismissed() const {
    const bool isLastSent = state() == State::SecondWave && !m_progress.wave.tid.isEmpty();
    return state() == State::Stopped || state() == State::Done || isLastSent;
}

bool Rollout::isRunning() const {
    return state() != State::Stopped && state() != State::Done;
}

void Rollout::setState(State state) {
    m_progress.state = state;
    emit moved();
}
