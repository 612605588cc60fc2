#include "tasks/queue/postwork.h"

#include "api/session/servicerequest.h"
#include "api/transport/downloadtarget.h"
#include "api/transport/transfer.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QDebug>
#include <QDir>

#include <algorithm>

namespace {

/// The devices that have told something. Tasks that list none are taken at their word.
int devicesTold(const TaskRecord &task) {
    return static_cast<int>(
        std::count_if(task.devices.begin(), task.devices.end(),
                      [](const TaskDevice &device) { return device.state == TaskState::done; }));
}

bool hasReport(const TaskRecord &task) {
    return task.type == TaskType::debugInfoExport && task.status != TaskState::aborted &&
           (devicesTold(task) > 0 || (task.devices.empty() && !task.isFailed()));
}

/// A name of this client's making: nothing that the service says reaches a path.
QString reportName(const PendingExport &pending, int devices) {
    const QDateTime asked = QDateTime::fromMSecsSinceEpoch(pending.askedAt);
    return QStringLiteral("debug-info_%1_%2-device%3")
        .arg(asked.toString(QStringLiteral("yyyy-MM-dd_HH-mm-ss")))
        .arg(devices)
        .arg(devices == 1 ? QString() : QStringLiteral("s"));
}

QString freePath(const QString &folder, const QString &name) {
    const QString stem = QDir(folder).filePath(name);
    QString path = stem + QStringLiteral(".zip");
    for (int number = 2; QFileInfo::exists(path); ++number)
        path = QStringLiteral("%1 (%2).zip").arg(stem, QString::number(number));
    return path;
}

QString reasonOf(unsigned result, const Transfer &transfer) {
    const QString text = transfer.failureText();
    return !text.isEmpty() ? text : CPostWork::tr("Reason: %1.").arg(apiResultText(result));
}

} // namespace

CPostWork &CPostWork::instance() {
    // Never destroyed: its runner may work until the program ends.
    static auto *const work = new CPostWork;
    return *work;
}

CPostWork::CPostWork() {
    connect(&CTaskInfoPool::instance(), &CTaskInfoPool::cleared, this, &CPostWork::cancel);
    connect(qApp, &QCoreApplication::aboutToQuit, this, &CPostWork::cancel);
}

void CPostWork::expectExport(const LoginInfo &login, const QString &tid, const QString &folder) {
    m_pending.add({tid, PendingExports::serverOf(login), login.account, folder,
                   QDateTime::currentMSecsSinceEpoch(), QString()});
}

void CPostWork::SyncExportDebugInfo() {
    if (m_pending.isEmpty())
        return;
    ServiceRequest::post(&m_runner, this,
                         [this](ServiceSession &session) {
                             collectAll(session);
                             return true;
                         },
                         {});
}

void CPostWork::collectAll(ServiceSession &session) {
    const TaskListPtr tasks = CTaskInfoPool::instance().taskList();
    if (!CTaskInfoPool::instance().isTaskListLoaded() || !session.isPresent())
        return;
    const bool newList = std::exchange(m_lastList, tasks) != tasks;
    for (const PendingExport &pending : m_pending.due(session.login(), PendingExports::Clock::now())) {
        const TaskRecordPtr task = tasks->find(pending.tid);
        if (isToCollect(pending, task, newList))
            collect(session, pending, *task);
        if (session.isLost() || !session.isPresent())
            return;
    }
}

/// Gives up what there will never be a report of.
bool CPostWork::isToCollect(const PendingExport &pending, const TaskRecordPtr &task, bool newList) {
    if (newList && m_pending.isLost(pending, task != nullptr)) {
        m_pending.remove(pending);
        tellFailure(tr("There will be no debug information in “%1”: the server does not know its task any "
                       "more.")
                        .arg(QDir::toNativeSeparators(pending.folder)));
    }
    if (!task || !task->isFinal())
        return false;
    if (hasReport(*task))
        return true;
    m_pending.remove(pending);
    // Whoever has cancelled it waits for nothing.
    if (task->status != TaskState::aborted)
        tellFailure(tr("There will be no debug information in “%1”: no device delivered any.")
                        .arg(QDir::toNativeSeparators(pending.folder)));
    return false;
}

void CPostWork::collect(ServiceSession &session, const PendingExport &pending, const TaskRecord &task) {
    // The program ended between the last step of the fetch and the note that it is done.
    if (!pending.target.isEmpty() && QFileInfo::exists(pending.target))
        return succeed(pending, pending.target);
    if (!pending.target.isEmpty())
        DownloadTarget::removeLeftovers(pending.folder, {});
    const QString path = freePath(pending.folder, reportName(pending, devicesTold(task)));
    m_pending.setTarget(pending, path);
    const auto transfer = std::make_shared<Transfer>();
    setTransfer(transfer);
    const unsigned result = session.call([&](CApiClient &client) {
        client.setTransfer(transfer);
        return client.exportFile(pending.tid.toUtf8().constData(), path.toUtf8().constData());
    });
    setTransfer({});
    if (result == ApiOk)
        return succeed(pending, path);
    m_pending.setTarget(pending, {});
    if (session.isPresent() && !session.isLost() && !transfer->isCancelled())
        fail(pending, reasonOf(result, *transfer));
}

void CPostWork::succeed(const PendingExport &pending, const QString &path) {
    m_pending.remove(pending);
    QMetaObject::invokeMethod(
        this, [this, path] { emit exported(path); }, Qt::QueuedConnection);
}

void CPostWork::fail(const PendingExport &pending, const QString &reason) {
    qWarning("The debug information of task %s could not be collected: %s", qUtf8Printable(pending.tid),
             qUtf8Printable(reason));
    if (m_pending.postpone(pending, PendingExports::Clock::now()))
        tellFailure(tr("The debug information could not be saved in “%1”, which will be tried again. %2")
                        .arg(QDir::toNativeSeparators(pending.folder), reason));
}

void CPostWork::tellFailure(const QString &message) {
    QMetaObject::invokeMethod(
        this, [this, message] { emit exportFailed(message); }, Qt::QueuedConnection);
}

void CPostWork::setTransfer(std::shared_ptr<Transfer> transfer) {
    const std::lock_guard lock(m_mutex);
    m_transfer = std::move(transfer);
}

/// Nobody waits for a report whose session has ended; the next one fetches it.
void CPostWork::cancel() {
    const std::lock_guard lock(m_mutex);
    if (m_transfer)
        m_transfer->cancel();
}
