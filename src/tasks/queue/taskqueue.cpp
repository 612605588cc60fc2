#include "tasks/queue/taskqueue.h"

#include "api/session/servicesession.h"
#include "api/session/sessionevents.h"
#include "api/transport/transfer.h"
#include "platform/log/messagelog.h"
#include "tasks/queue/failedoperations.h"
#include "tasks/service/existingdevices.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/taskstate.h"
#include "tasks/service/tasktargets.h"
#include "tasks/service/tasktype.h"

#include <QCoreApplication>
#include <QDebug>
#include <QPointer>
#include <QScopedValueRollback>
#include <QTimer>

#include <nlohmann/json.hpp>

#include <algorithm>

namespace {

constexpr int tickMs = 1000;
quint64 presentSession() {
    return CLocalStore::instance().loginInfo().generation;
}

/// "%d" in a log line stands for the result.
void logLine(QtMsgType type, const char *line, unsigned result) {
    if (!line)
        return;
    const QString text = QString::fromLatin1(line).replace(QStringLiteral("%d"), QString::number(result));
    if (type == QtWarningMsg)
        qWarning("%s", qUtf8Printable(text));
    else
        qDebug("%s", qUtf8Printable(text));
}

/// The addresses that the task list gives for devices of a task.
QSet<QString> macsOf(const QString &tid, const QStringList &deviceIds) {
    QSet<QString> macs;
    const QSet<QString> wanted(deviceIds.begin(), deviceIds.end());
    if (const TaskRecordPtr task = CTaskInfoPool::instance().taskList()->find(tid)) {
        for (const TaskDevice &device : task->devices) {
            if (wanted.contains(device.target->id))
                macs.insert(TaskTargets::plainMac(device.target->mac));
        }
    }
    return macs;
}

/// Takes the other devices out of a record, and the files of theirs.
void keepOnly(const TaskKind &family, JSON &record, const QStringList &deviceIds, const QSet<QString> &macs) {
    JSON &devices = record[family.targets];
    devices = TaskTargets::only(devices, deviceIds);
    for (const char *member : {"cert", "pkey"}) {
        if (const auto files = record.find(member); files != record.end())
            *files = TaskTargets::onlyFilesOf(*files, macs);
    }
}

QString reasonOf(unsigned result, const Transfer &transfer) {
    const QString text = transfer.failureText();
    return !text.isEmpty() ? text : TaskQueue::tr("Reason: %1.").arg(apiResultText(result));
}

QString sessionEndedText() {
    return TaskQueue::tr("The server has ended the session.");
}

FailedSubmission failureOf(const TaskKind &family, const JSON &record) {
    FailedSubmission failure;
    failure.ctid = stringMember(record, "ctid");
    failure.serviceType = QString::fromLatin1(family.serviceType);
    failure.devices = static_cast<int>(record.at(family.targets).size());
    return failure;
}

/// What is sent, for people.
QString nameOf(const TaskKind &family, const TaskContext &step) {
    return family.fileName ? stringMember(step.record, family.fileName)
                           : TaskType::title(QString::fromLatin1(family.serviceType));
}

} // namespace

TaskQueue::TaskQueue(std::span<const TaskKind> families, const char *iterationError)
    : m_families(families), m_walkError(iterationError), m_timer(new QTimer(this)) {
    m_timer->setInterval(tickMs);
    connect(m_timer, &QTimer::timeout, this, &TaskQueue::onTimeout);
    connect(&CTaskInfoPool::instance(), &CTaskInfoPool::cleared, this, &TaskQueue::onSessionEnded);
    connect(&CTaskInfoPool::instance(), &CTaskInfoPool::taskListUpdated, this, &TaskQueue::onTaskListUpdated);
    connect(qApp, &QCoreApplication::aboutToQuit, this, &TaskQueue::onQuit);
}

TaskQueue::~TaskQueue() {
    m_timer->stop();
    onQuit();
    m_worker.wait();
}

void TaskQueue::setCompletionCallback(quintptr context, Completion completion) {
    const std::lock_guard lock(m_mutex);
    m_completionContext = context;
    m_completion = std::move(completion);
}

const TaskKind *TaskQueue::familyOf(std::string_view type) const {
    const auto found = std::find_if(m_families.begin(), m_families.end(),
                                    [type](const TaskKind &family) { return type == family.type; });
    return found == m_families.end() ? nullptr : &*found;
}

bool TaskQueue::insert(const char *type, JSON record, QString *ctid) {
    const TaskKind *family = familyOf(type);
    const std::string id = family ? m_records.append(std::move(record), type, family->idPrefix,
                                                     CLocalStore::instance().loginInfo())
                                  : "";
    if (id.empty()) {
        qWarning("Inserting new task with the invalid parameter.");
        return false;
    }
    if (ctid)
        *ctid = QString::fromStdString(id);
    QMetaObject::invokeMethod(this, &TaskQueue::startTimer);
    return true;
}

void TaskQueue::startTimer() {
    if (!m_timer->isActive())
        m_timer->start();
}

void TaskQueue::onTimeout() {
    if (m_ticking || !m_records.hasPending())
        return;
    const QScopedValueRollback ticking(m_ticking, true);
    if (m_worker.isRunning())
        return;
    m_worker.setUp(reinterpret_cast<quintptr>(this), [this](quintptr) { handlingTask(); });
    m_worker.start();
}

void TaskQueue::handlingTask() {
    try {
        std::size_t place = 0;
        JSON record;
        while (!m_stopping && m_records.takeNext(place, record))
            runStep(*familyOf(record.at("type").get<std::string>()), record);
    } catch (const std::exception &error) {
        qWarning("%s%s", m_walkError, error.what());
    } catch (...) {
        qWarning("%sUnknown exception", m_walkError);
    }
}

void TaskQueue::runStep(const TaskKind &family, JSON &record) {
    ServiceSession session(CLocalStore::instance().loginInfo());
    // Queued in a session that has ended: it must not run as somebody else, or on another server.
    if (QueuedRecords::sessionOf(record) != session.login().generation) {
        abandonOtherSessions(family, record);
        return complete(ApiInvalidArgument);
    }
    TaskContext step{session, record, std::make_shared<Transfer>()};
    setSending({nameOf(family, step), step.transfer, {}});
    setState(family, record, family.workingState());
    ServiceTask::Outcome outcome{ApiException, {}, {}};
    try {
        outcome = perform(family, step, record);
    } catch (const std::exception &error) {
        qWarning("%s%s", family.lines.exception, error.what());
        outcome.tid = QString::fromStdString(step.tid);
    } catch (...) {
        qWarning("%sUnknown exception", family.lines.exception);
        outcome.tid = QString::fromStdString(step.tid);
    }
    setSending({});
    finish(family, step, outcome);
}

ServiceTask::Outcome TaskQueue::perform(const TaskKind &family, TaskContext &step, JSON &record) {
    const LoginInfo &login = step.session.login();
    qDebug("API access info ip: %s, port: %d, account: %s, token: %s", qUtf8Printable(login.address),
           static_cast<int>(login.port), qUtf8Printable(login.account),
           MessageLog::secret(login.token).constData());
    ServiceTask::Steps steps;
    steps.type = QString::fromLatin1(family.serviceType);
    steps.devices = [&] { return family.devices(record); };
    steps.ids = TaskTargets::idTexts(record.at(family.targets));
    steps.keepOnly = [&](const ExistingDevices &existing) {
        keepOnly(family, record, existing.ids, existing.macs);
    };
    const QString ctid = stringMember(record, "ctid");
    steps.retry = [this, &family, ctid](const QString &tid) { return retryOf(family, ctid, tid); };
    steps.made = [&](const ServiceTask::Outcome &made) { onTaskMade(family, step, made); };
    steps.work = [&](const QString &) { return work(family, step); };
    ServiceTask::Outcome outcome = ServiceTask::run(step.session, steps);
    outcome.mayHaveBegun = outcome.mayHaveBegun && step.hasBegun;
    // The service would wait for the rest of it until it gives up.
    if (outcome.result != ApiOk && !outcome.tid.isEmpty() && step.transfer->isCancelled() &&
        step.session.isPresent())
        CTaskInfoPool::instance().updateTaskState(step.session, outcome.tid, TaskState::aborted);
    return outcome;
}

void TaskQueue::onTaskMade(const TaskKind &family, TaskContext &step, const ServiceTask::Outcome &made) {
    step.tid = made.tid.toStdString();
    setSending({nameOf(family, step), step.transfer, made.tid});
    tell(step, [this, made, ctid = stringMember(step.record, "ctid")] {
        if (!made.missing.isEmpty())
            emit devicesLeftOut(ctid, static_cast<int>(made.missing.size()));
        emit serviceTaskMade(ctid, made.tid);
    });
}

unsigned TaskQueue::work(const TaskKind &family, TaskContext &step) {
    family.announce(step);
    const unsigned result = family.work(step);
    if (result == ApiOk)
        logLine(QtDebugMsg, family.lines.success, result);
    else
        logLine(QtWarningMsg, family.lines.failure, result);
    return result;
}

void TaskQueue::finish(const TaskKind &family, const TaskContext &step, const ServiceTask::Outcome &outcome) {
    const bool over = step.session.isLost() || !step.session.isPresent();
    if (step.session.isLost())
        tell(step, [generation = step.session.login().generation] {
            SessionEvents::instance().reportLost(generation);
        });
    if (outcome.result == ApiOk)
        setState(family, step.record, family.successState());
    else if (!outcome.tid.isEmpty() || over)
        setState(family, step.record, family.failureState());
    if (outcome.result != ApiOk && (over || !step.transfer->isCancelled())) {
        FailedSubmission failure = failureOf(family, step.record);
        failure.reason = over ? sessionEndedText() : reasonOf(outcome.result, *step.transfer);
        failure.tid = QString::fromStdString(step.tid);
        failure.mayHaveBegun = outcome.mayHaveBegun;
        report(step.session.login(), std::move(failure));
    }
    complete(outcome.result);
}

/// The record's operation ended with the session in which it was queued. Any thread.
void TaskQueue::abandonOtherSessions(const TaskKind &family, const JSON &record) {
    // The worker and the end of the session may both come to it.
    if (!setState(family, record, family.failureState()))
        return;
    FailedSubmission failure = failureOf(family, record);
    failure.reason = sessionEndedText();
    report(QueuedRecords::loginOf(record), std::move(failure));
}

void TaskQueue::report(const LoginInfo &login, FailedSubmission failure) {
    auto inOwnThread = [this, login, failure = std::move(failure)]() mutable {
        failure.isFollowed = m_followed.contains(failure.ctid);
        const bool isLost = SessionEvents::instance().wasLost(login.generation);
        if (presentSession() == login.generation && !isLost)
            emit handOverFailed(failure);
        if (failure.isFollowed)
            return;
        const QPointer queue(this);
        const QString ctid = failure.ctid;
        FailedOperations::Entry entry{std::move(failure), {}, [queue, ctid] {
                                          if (queue)
                                              queue->dismiss(ctid);
                                      }};
        if (!entry.failure.mayHaveBegun)
            entry.startAgain = [queue, ctid] {
                if (queue)
                    queue->startAgain(ctid);
            };
        FailedOperations::instance().report(login, std::move(entry));
    };
    QMetaObject::invokeMethod(this, std::move(inOwnThread), Qt::QueuedConnection);
}

void TaskQueue::complete(quint32 error) {
    std::unique_lock lock(m_mutex);
    const Completion completion = m_completion;
    const quintptr context = m_completionContext;
    lock.unlock();
    if (completion)
        completion(context, error);
}

/// False when it is in that state already.
bool TaskQueue::setState(const TaskKind &family, const JSON &record, const char *state) {
    try {
        const auto ctid = record.at("ctid").get<std::string>();
        const bool isOver = state != std::string_view(family.workingState());
        return m_records.setState(ctid, state,
                                  isOver ? QueuedRecords::Secret::Wipe : QueuedRecords::Secret::Keep);
    } catch (const std::exception &error) {
        qWarning("%s%s", family.lines.update, error.what());
    } catch (...) {
        qWarning("%sUnknown exception", family.lines.update);
    }
    return false;
}

QString TaskQueue::stateOf(const QString &ctid) const {
    return stringMember(m_records.find(ctid.toStdString()), "state");
}

RetryRegistry::Repeat TaskQueue::retryOf(const TaskKind &family, const QString &ctid, const QString &tid) {
    const auto retry = [queue = QPointer(this), ctid, tid](const QStringList &ids) {
        if (queue)
            queue->repeat(ctid, tid, ids);
    };
    return {retry, family.asksAgain};
}

void TaskQueue::repeat(const QString &ctid, const QString &tid, const QStringList &deviceIds) {
    JSON record = m_records.find(ctid.toStdString());
    const TaskKind *family = familyOf(textMember(record, "type"));
    if (!family)
        return;
    if (family->asksAgain)
        return emit dialogNeeded(QString::fromLatin1(family->serviceType), deviceIds);
    // From now on it is the new task that may be repeated.
    RetryRegistry::instance().take(tid);
    FailedOperations::instance().forget(tid);
    keepOnly(*family, record, deviceIds, macsOf(tid, deviceIds));
    insertAgain(*family, std::move(record));
}

void TaskQueue::insertAgain(const TaskKind &family, JSON record) {
    record.erase("state");
    insert(family.type, std::move(record));
}

void TaskQueue::startAgain(const QString &ctid) {
    JSON record = m_records.find(ctid.toStdString());
    const TaskKind *family = familyOf(textMember(record, "type"));
    if (!family)
        return;
    // While its task has not been made a record still has what it was inserted with.
    if (family->asksAgain && textMember(record, "state") != family->workingState())
        return emit dialogNeeded(QString::fromLatin1(family->serviceType),
                                 TaskTargets::idTexts(record.at(family->targets)));
    insertAgain(*family, std::move(record));
    dismiss(ctid);
}

void TaskQueue::setFollowed(const QString &ctid, bool followed) {
    if (followed)
        m_followed.insert(ctid);
    else
        m_followed.remove(ctid);
}

void TaskQueue::dismiss(const QString &ctid) {
    m_records.wipeSecret(ctid.toStdString());
}

void TaskQueue::onSessionEnded() {
    cancelSending();
    for (const JSON &record : m_records.abandonOtherSessions(presentSession())) {
        const TaskKind *family = familyOf(textMember(record, "type"));
        abandonOtherSessions(*family, record);
    }
}

/// A task that was cancelled in the list needs no more bytes.
void TaskQueue::onTaskListUpdated() {
    const Sending now = sending();
    if (!now.transfer || now.tid.isEmpty())
        return;
    const TaskRecordPtr task = CTaskInfoPool::instance().taskList()->find(now.tid);
    if (task && task->status == TaskState::aborted)
        now.transfer->cancel();
}

void TaskQueue::onQuit() {
    m_stopping = true;
    cancelSending();
}

TaskQueue::Sending TaskQueue::sending() const {
    const std::lock_guard lock(m_mutex);
    return m_sending;
}

void TaskQueue::setSending(Sending sending) {
    const std::lock_guard lock(m_mutex);
    m_sending = std::move(sending);
}

void TaskQueue::cancelSending() {
    if (const std::shared_ptr<Transfer> transfer = sending().transfer)
        transfer->cancel();
}

/// Who listens lives in the user-interface thread, and hears nothing of a session that has ended by then.
template <typename Told>
void TaskQueue::tell(const TaskContext &step, Told told) {
    auto tellOwn = [told = std::move(told), generation = step.session.login().generation]() mutable {
        if (presentSession() == generation)
            told();
    };
    QMetaObject::invokeMethod(this, std::move(tellOwn), Qt::QueuedConnection);
}
