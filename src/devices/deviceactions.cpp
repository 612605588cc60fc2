#include "deviceactions.h"

#include "servicerequest.h"
#include "taskrepeats.h"
#include "tasktype.h"

#include <QPointer>

void DeviceActions::restart(const QStringList &deviceIds) {
    start(TaskType::title(TaskType::restart), &DeviceOperations::restart, deviceIds);
}

void DeviceActions::start(const QString &name, Operation operation, const QStringList &deviceIds) {
    const bool started = ServiceRequest::post(
        NetJob::createRunner(qUtf8Printable(name)), this,
        [operation, deviceIds](ServiceSession &session) { return operation(session, deviceIds); },
        [this, name, operation](const DeviceOperations::Outcome &outcome) {
            if (!outcome.tid.isEmpty())
                TaskRepeats::instance().remember(
                    outcome.tid, {[actions = QPointer(this), name, operation](const QStringList &ids) {
                        if (actions)
                            actions->start(name, operation, ids);
                    }});
            if (outcome.result != ApiOk)
                emit failed(tr("%1 could not be started: %2.").arg(name, apiResultText(outcome.result)));
        },
        [this, name](JobEnd end) {
            if (end == JobEnd::NotRun || end == JobEnd::Failed)
                emit failed(tr("%1 could not be started: the client is busy, try again.").arg(name));
        });
    if (!started)
        emit failed(tr("%1 could not be started: the client is busy, try again.").arg(name));
}
