#include "api/session/nettask.h"

#include "api/session/requestturn.h"
#include "platform/log/crashcatcher.h"

#include <QDeadlineTimer>
#include <QDebug>

#include <algorithm>
#include <chrono>
#include <vector>

namespace {

constexpr std::chrono::milliseconds turnWait{30000};
/// The transport matches status lines with a recursive expression; a long line needs a deep stack.
constexpr uint stackBytes = 64u << 20;

/// Every runner that exists; touched in the user-interface thread only.
std::vector<NetTask *> &runners() {
    static std::vector<NetTask *> all;
    return all;
}

} // namespace

void NetTask::DeleteWhenFinished::operator()(NetTask *runner) const {
    // Connected first: a runner that finishes in between would tell nobody and stay for ever.
    QObject::connect(runner, &QThread::finished, runner, &QObject::deleteLater);
    if (!runner->isRunning())
        delete runner;
}

NetTask::NetTask(Turn turn) : m_turn(turn) {
    setStackSize(stackBytes);
    runners().push_back(this);
}

NetTask::~NetTask() {
    // Deleting a running thread would end the program, and terminating it would keep the turn for ever.
    wait();
    std::erase(runners(), this);
}

void NetTask::setUp(quintptr context, Job job, Preparation preparation) {
    m_context = context;
    m_job = std::move(job);
    m_preparation = std::move(preparation);
}

void NetTask::run() {
    const CrashCatcher::ThreadGuard guard;
    try {
        if (m_preparation)
            m_preparation();
        runJob();
    } catch (const std::exception &error) {
        qWarning("Encountered unexpected error in NetTask: %s", error.what());
    } catch (...) {
        qWarning("Encountered unexpected error in NetTask: Unknown exception");
    }
}

void NetTask::runJob() {
    if (!m_job)
        return;
    if (m_turn == Turn::Beside)
        return m_job(m_context);
    const RequestTurn turn(m_turn == Turn::Reading ? RequestTurn::Order::Reading : RequestTurn::Order::User,
                           turnWait);
    if (turn.isHeld())
        m_job(m_context);
}

bool NetTask::waitForAll(int milliseconds) {
    const QDeadlineTimer deadline(milliseconds);
    const std::vector<NetTask *> all = runners();
    return std::all_of(all.begin(), all.end(), [&](NetTask *runner) { return runner->wait(deadline); });
}

void NetTask::runAndWait(const std::function<void()> &function) {
    const std::unique_ptr<QThread> thread(QThread::create([&function] {
        const CrashCatcher::ThreadGuard guard;
        function();
    }));
    thread->setStackSize(stackBytes);
    thread->start();
    thread->wait();
}
