#include "tasks/queue/servicetask.h"

#include "api/client/apilog.h"
#include "api/session/servicesession.h"
#include "tasks/queue/taskmaker.h"
#include "tasks/service/taskinfopool.h"

#include <QCoreApplication>

#include <nlohmann/json.hpp>

namespace ServiceTask {

namespace {

/// The registry belongs to the user-interface thread. The session may have ended until this gets there.
void registerRetry(const ServiceSession &session, const QString &tid, RetryRegistry::Repeat retry) {
    const auto remember = [tid, retry = std::move(retry), generation = session.login().generation] {
        if (CLocalStore::instance().loginInfo().generation == generation)
            RetryRegistry::instance().remember(tid, retry);
    };
    QMetaObject::invokeMethod(QCoreApplication::instance(), remember, Qt::QueuedConnection);
}

Outcome makeTask(ServiceSession &session, const Steps &steps) {
    std::string tid;
    const unsigned result = TaskMaker::make(session, steps.type.toUtf8().constData(), steps.devices(), tid);
    return {result, QString::fromStdString(tid), {}};
}

} // namespace

Outcome withoutMissing(ServiceSession &session, const QStringList &ids,
                       const std::function<void(const ExistingDevices &)> &keepOnly,
                       const std::function<Outcome()> &attempt) {
    Outcome outcome = attempt();
    if (outcome.result != ApiServerError)
        return outcome;
    const ExistingDevices existing = ExistingDevices::among(ids, session);
    if (existing.canRetry()) {
        keepOnly(existing);
        outcome = attempt();
    }
    outcome.missing = existing.vanished;
    return outcome;
}

Outcome run(ServiceSession &session, const Steps &steps) {
    Outcome outcome =
        withoutMissing(session, steps.ids, steps.keepOnly, [&] { return makeTask(session, steps); });
    if (ApiLog::logged("newTaskState", outcome.result) != ApiOk)
        return outcome;
    // The task is to be seen before its work begins, and a retry is only kept for tasks in the list.
    CTaskInfoPool::instance().fetchTaskStatuses(session);
    registerRetry(session, outcome.tid, steps.retry(outcome.tid));
    if (steps.made)
        steps.made(outcome);
    outcome.result = steps.work(outcome.tid);
    outcome.mayHaveBegun = session.isUnanswered();
    return outcome;
}

} // namespace ServiceTask
