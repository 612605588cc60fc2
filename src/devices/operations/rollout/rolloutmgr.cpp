#include "devices/operations/rollout/rolloutmgr.h"

#include "api/session/netjob.h"
#include "api/session/sessionevents.h"
#include "devices/operations/firmware/firmwareupload.h"
#include "store/localstore.h"
#include "store/storewriter.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/tasktargets.h"

#include <QCryptographicHash>
#include <QDateTime>
#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <chrono>

namespace {

constexpr int tickMs = 1000;

/// A fixed word for server and account, whatever characters these have.
QString wordOf(const LoginInfo &login) {
    const QString text = QStringLiteral("%1:%2\n%3").arg(login.address).arg(login.port).arg(login.account);
    return QString::fromLatin1(
        QCryptographicHash::hash(text.toUtf8(), QCryptographicHash::Sha256).toHex().left(32));
}

} // namespace

RolloutMgr &RolloutMgr::instance() {
    // Never destroyed, as the queue and the lists that it follows.
    static auto *const manager = new RolloutMgr;
    return *manager;
}

RolloutMgr::RolloutMgr() {
    m_timer.setInterval(tickMs);
    connect(&m_timer, &QTimer::timeout, this, &RolloutMgr::advanceAll);
    auto &pool = CTaskInfoPool::instance();
    connect(&pool, &CTaskInfoPool::taskListUpdated, this, &RolloutMgr::onTaskListUpdated);
    connect(&pool, &CTaskInfoPool::cleared, this, &RolloutMgr::onSessionEnded);
    auto &uploads = UploadTaskMgr::instance();
    connect(&uploads, &TaskQueue::serviceTaskMade, this, [this](const QString &ctid, const QString &tid) {
        for (Rollout *each : rollouts())
            each->onServiceTaskMade(ctid, tid);
    });
    connect(&uploads, &TaskQueue::handOverFailed, this, [this](const FailedSubmission &failure) {
        // What may have begun shows in its task, which is followed.
        for (Rollout *each : rollouts()) {
            if (!failure.mayHaveBegun)
                each->onHandOverFailed(failure.ctid, failure.reason);
        }
    });
    RetryRegistry::instance().setGuard([this](const QString &tid) {
        return std::any_of(m_rollouts.begin(), m_rollouts.end(), [&tid](const auto &each) {
            return each->progress().wave.tid == tid && each->mayRepeatWave();
        });
    });
}

void RolloutMgr::start(RolloutPlan plan) {
    beginSession();
    add(std::make_shared<const RolloutPlan>(std::move(plan)))->begin();
}

Rollout *RolloutMgr::add(RolloutPlanPtr plan) {
    Rollout::Environment surroundings;
    surroundings.now = [] { return QDateTime::currentMSecsSinceEpoch(); };
    surroundings.steady = [] {
        using namespace std::chrono;
        return qint64{duration_cast<milliseconds>(steady_clock::now().time_since_epoch()).count()};
    };
    surroundings.tasks = [] { return CTaskInfoPool::instance().taskList(); };
    surroundings.upload = &RolloutMgr::upload;
    m_rollouts.push_back(std::make_unique<Rollout>(std::move(plan), std::move(surroundings)));
    Rollout *rollout = m_rollouts.back().get();
    connect(rollout, &Rollout::moved, this, [this] {
        if (isBusy() && !m_timer.isActive())
            m_timer.start();
        keep();
        emit changed();
    });
    connect(rollout, &Rollout::counted, this, &RolloutMgr::changed);
    emit changed();
    return rollout;
}

/// Between the waves somebody may have put another image in the place of the first one.
void RolloutMgr::upload(Rollout &rollout, const QStringList &deviceIds, const QString &actionTime) {
    const FileCheck &image = rollout.plan().image;
    NetJob::post(
        NetJob::createRunner("checking a firmware image", NetTask::Turn::Beside), &rollout,
        [path = image.path, deviceIds] {
            return std::make_pair(FileCheck::ofFile(path), TaskTargets::ids(deviceIds));
        },
        [&rollout, actionTime](const std::pair<FileCheck, JSON> &prepared) {
            const auto &[found, ids] = prepared;
            if (!found.isGood())
                rollout.onNotBegun(found.problem);
            else if (!found.isSame(rollout.plan().image))
                rollout.onNotBegun(tr("The image has changed since the rollout began."));
            else
                insert(rollout, ids, actionTime);
        },
        [&rollout](JobOutcome end) {
            if (end != JobOutcome::Delivered)
                rollout.onNotBegun(tr("The image could not be checked."));
        });
}

void RolloutMgr::insert(Rollout &rollout, const JSON &deviceIds, const QString &actionTime) {
    QString ctid;
    if (!FirmwareUpload::insert(rollout.plan().image, deviceIds, rollout.plan().fwid, actionTime, &ctid))
        return rollout.onNotBegun(tr("The upload could not be started."));
    // The rollout offers to go on with it; begun again elsewhere, it would be sent twice.
    UploadTaskMgr::instance().setFollowed(ctid, true);
    rollout.onQueued(ctid);
}

std::vector<Rollout *> RolloutMgr::rollouts() const {
    std::vector<Rollout *> all;
    for (const auto &each : m_rollouts)
        all.push_back(each.get());
    return all;
}

bool RolloutMgr::isBusy() const {
    return std::any_of(m_rollouts.begin(), m_rollouts.end(),
                       [](const auto &each) { return each->isRunning(); });
}

void RolloutMgr::dismiss(Rollout *rollout) {
    const auto found = std::find_if(m_rollouts.begin(), m_rollouts.end(),
                                    [rollout](const auto &each) { return each.get() == rollout; });
    if (found == m_rollouts.end())
        return;
    UploadTaskMgr::instance().setFollowed(rollout->progress().wave.ctid, false);
    m_rollouts.erase(found);
    keep();
    emit changed();
}

void RolloutMgr::advanceAll() {
    for (Rollout *each : rollouts())
        each->advance();
    if (!isBusy())
        m_timer.stop();
}

void RolloutMgr::onTaskListUpdated() {
    beginSession();
    advanceAll();
}

/// Rollouts of an earlier run of the program come back with the first list of the session, which tells how
/// far their tasks are by now.
void RolloutMgr::beginSession() {
    const LoginInfo login = CLocalStore::instance().loginInfo();
    if (!login.isComplete() || login.generation == m_generation)
        return;
    m_generation = login.generation;
    m_session = wordOf(login);
    m_restored = false;
    restore();
}

void RolloutMgr::restore() {
    NetJob::post(
        NetJob::createRunner("reading the rollouts", NetTask::Turn::Beside), this,
        [session = m_session] { return RolloutRecords::parse(CLocalStore::instance().fwRollouts(session)); },
        [this, generation = m_generation](const std::vector<RolloutRecords::Record> &records) {
            if (generation != CLocalStore::instance().loginInfo().generation)
                return;
            m_restored = true;
            for (const RolloutRecords::Record &record : records)
                add(record.plan)->resume(record.progress);
            if (!m_rollouts.empty())
                keep();
        });
}

/// Not before the earlier ones have been read, which would be lost otherwise.
void RolloutMgr::keep() {
    if (!m_restored)
        return;
    std::vector<RolloutRecords::Record> records;
    for (const auto &each : m_rollouts)
        records.push_back({each->planPtr(), each->progress()});
    StoreWriter::post([session = m_session, records = std::move(records)] {
        const QString text = records.empty() ? QString() : RolloutRecords::toText(records);
        CLocalStore::instance().setFwRollouts(session, text);
    });
}

/// A user who logs off is done with them; a session that the service has ended goes on with the next log-in.
void RolloutMgr::onSessionEnded() {
    const bool comesBack = m_restored && SessionEvents::instance().wasLost(m_generation);
    QStringList names;
    for (const auto &each : m_rollouts) {
        if (each->state() != Rollout::State::Done)
            names += each->plan().image.name;
    }
    m_timer.stop();
    m_rollouts.clear();
    if (!comesBack)
        keep();
    m_restored = false;
    emit changed();
    if (names.isEmpty())
        return;
    qWarning("The session has ended before %d rollout(s)", static_cast<int>(names.size()));
    const int count = static_cast<int>(names.size());
    const QString message =
        comesBack ? tr("The server has ended the session. The rollout(s) of %1 go on after the next log-in.",
                       nullptr, count)
                  : tr("The session has ended, and with it the rollout(s) of %1. Waves that were sent go on.",
                       nullptr, count);
    emit dropped(message.arg(names.join(QStringLiteral(", "))));
}
