#include "devices/operations/deviceactions.h"

#include "api/session/jobendtext.h"
#include "api/session/servicerequest.h"
#include "devices/inventory/deviceexport.h"
#include "devices/sites/devicecommit.h"
#include "tasks/queue/failedoperations.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/tasktype.h"

#include <QPointer>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <chrono>
#include <thread>

struct DeviceActions::Change {
    JSON records = JSON::array();
    QString message;
};

struct DeviceActions::CommitResult {
    unsigned code = ApiOk;
    bool isSent = false;
    QString message; ///< what was done
};

namespace {

using SiteMembership::Outcome;

int countOf(const std::vector<SiteMembership::DeviceOutcome> &outcomes, Outcome outcome) {
    return static_cast<int>(
        std::count_if(outcomes.begin(), outcomes.end(), [outcome](const SiteMembership::DeviceOutcome &each) {
            return each.outcome == outcome;
        }));
}

bool isAuthorized(DeviceStatusCode code) {
    return code == DeviceStatusCode::Authorized || code == DeviceStatusCode::Maintaining;
}

int authorizedOf(const std::map<DeviceStatusCode, int> &states) {
    int count = 0;
    for (const auto &[code, devices] : states)
        count += isAuthorized(code) ? devices : 0;
    return count;
}

/// How many devices take the credentials, and what the others say.
QString authorizationText(const std::map<DeviceStatusCode, int> &states, int asked) {
    const int good = authorizedOf(states);
    QStringList others;
    for (const auto &[code, count] : states) {
        if (!isAuthorized(code))
            others += DeviceActions::tr("%1: %2").arg(DeviceStatus::text(code).trimmed()).arg(count);
    }
    if (others.isEmpty())
        return DeviceActions::tr("%1 of %2 devices are authorized.").arg(good).arg(asked);
    return DeviceActions::tr("%1 of %2 devices are authorized so far. %3.")
        .arg(QString::number(good), QString::number(asked), others.join(QStringLiteral(", ")));
}

constexpr std::chrono::seconds authorizationTime{2};

/// One message of several sentences: each message takes the place of the one before it.
QString joined(QStringList sentences) {
    sentences.removeAll(QString());
    return sentences.join(QLatin1Char(' '));
}

/// Empty for none.
QString leftOutText(qsizetype vanished) {
    if (vanished == 0)
        return {};
    return DeviceActions::tr("Left out: %n device(s) that the server does not manage any more.", nullptr,
                             static_cast<int>(vanished));
}

/// Why an operation under a task did not go well.
QString failureText(const QString &name, const DeviceOperations::Outcome &outcome) {
    const QString reason = apiResultText(outcome.result);
    if (outcome.tid.isEmpty())
        return DeviceActions::tr("%1 could not be started: %2.").arg(name, reason);
    if (!outcome.mayHaveBegun)
        return DeviceActions::tr("%1 failed: %2.").arg(name, reason);
    return DeviceActions::tr("%1 may have begun: %2. Look at its task before you try again.")
        .arg(name, reason);
}

/// Why an operation has no outcome.
QString failureText(const QString &name, JobOutcome end) {
    const QString text = end == JobOutcome::NotRun ? DeviceActions::tr("%1 could not be started: %2.")
                                                   : DeviceActions::tr("%1 failed: %2.");
    return text.arg(name, jobEndText(end));
}

/// Keeps for the next log-in what the service did not come to because it ended the session.
void reportSessionEnd(const LoginInfo &login, const QString &name, qsizetype devices,
                      const DeviceOperations::Outcome &outcome, std::function<void()> again) {
    if (outcome.result == ApiOk)
        return;
    FailedSubmission failure;
    failure.title = name;
    failure.devices = static_cast<int>(devices);
    failure.reason = DeviceActions::tr("The server has ended the session.");
    failure.tid = outcome.tid;
    failure.mayHaveBegun = outcome.mayHaveBegun;
    if (failure.mayHaveBegun)
        again = nullptr;
    FailedOperations::instance().report(login, {failure, std::move(again), {}});
}

/// What an operation has come to by the time its session ends.
std::shared_ptr<DeviceOperations::Outcome> notBegun() {
    auto outcome = std::make_shared<DeviceOperations::Outcome>();
    outcome->result = ApiInvalidArgument;
    return outcome;
}

} // namespace

void DeviceActions::authorize(const QStringList &deviceIds, const QString &name, const QString &password) {
    const QString title = tr("Authorize Device");
    const auto known = notBegun();
    const bool started = ServiceRequest::post(
        NetJob::createRunner("authorizing devices"), this,
        [deviceIds, name, password, known](ServiceSession &session) {
            return *known = DeviceOperations::authorize(session, deviceIds, name, password);
        },
        [this, title, deviceIds](const DeviceOperations::Outcome &outcome) {
            const QString leftOut = leftOutText(outcome.missing.size());
            if (outcome.result != ApiOk)
                return emit failed(
                    joined({tr("%1 failed: %2.").arg(title, apiResultText(outcome.result)), leftOut}));
            QStringList asked = deviceIds;
            asked.removeIf([&](const QString &id) { return outcome.missing.contains(id); });
            emit done(joined({tr("The credentials are on their way to %n device(s).", nullptr,
                                 static_cast<int>(asked.size())),
                              leftOut}));
            tellAuthorized(asked, leftOut);
        },
        [this, title, known, count = deviceIds.size(),
         login = CLocalStore::instance().loginInfo()](JobOutcome end) {
            if (end == JobOutcome::SessionGone)
                reportSessionEnd(login, title, count, *known, {});
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                emit failed(failureText(title, end));
        });
    if (!started)
        emit failed(failureText(title, JobOutcome::NotRun));
}

/// The devices need a moment to look at the credentials.
void DeviceActions::tellAuthorized(const QStringList &deviceIds, const QString &leftOut) {
    ServiceRequest::post(
        NetJob::createRunner("reading the states after an authorization", NetTask::Turn::Beside), this,
        [deviceIds](ServiceSession &session) { return DeviceOperations::readStates(session, deviceIds); },
        [this, leftOut,
         asked = static_cast<int>(deviceIds.size())](const std::map<DeviceStatusCode, int> &states) {
            emit statesChanged();
            if (states.empty())
                return;
            const QString message = joined({authorizationText(states, asked), leftOut});
            if (authorizedOf(states) == asked)
                emit done(message);
            else
                emit failed(message);
        },
        [](JobOutcome end) {
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                qDebug("HTTP API(listDeviceStatus) failed! (%d)", static_cast<int>(ApiException));
        },
        [] { std::this_thread::sleep_for(authorizationTime); });
}

void DeviceActions::deleteDevices(const QStringList &deviceIds) {
    const auto change = [](const JSON &present) {
        Change made{present, tr("%n device(s) deleted.", nullptr, static_cast<int>(present.size()))};
        for (JSON &record : made.records) {
            qDebug("At device overview, remove device id directly: %s",
                   qUtf8Printable(DeviceRecords::identityOf(record)));
            // A record without sites is how the service is told to forget a device.
            record["siteid"] = JSON::array();
        }
        return made;
    };
    commit(tr("Deleting devices"), deviceIds, change, [this] { emit devicesDeleted(); });
}

void DeviceActions::removeFromSite(const QStringList &deviceIds, const QString &siteId) {
    const auto change = [siteId](const JSON &present) {
        Change made;
        const auto outcomes = SiteMembership::removeFromSite(present, siteId, made.records);
        made.message =
            tr("%n device(s) removed from the site.", nullptr, countOf(outcomes, Outcome::Removed));
        return made;
    };
    commit(tr("Removing devices from the site"), deviceIds, change, [this] { emit devicesDeleted(); });
}

void DeviceActions::putIntoSite(const QStringList &deviceIds, const SiteMembership::Drop &drop) {
    const auto change = [drop](const JSON &present) {
        Change made;
        const auto outcomes = SiteMembership::assign(present, drop, made.records);
        const int moved = countOf(outcomes, Outcome::Moved);
        const int added = countOf(outcomes, Outcome::Added);
        QStringList parts;
        if (moved > 0)
            parts += tr("%n device(s) moved.", nullptr, moved);
        if (added > 0)
            parts += tr("%n device(s) added to the site.", nullptr, added);
        if (const int unchanged = countOf(outcomes, Outcome::Unchanged); unchanged > 0)
            parts += tr("%n device(s) in the site already.", nullptr, unchanged);
        made.message = joined(parts);
        return made;
    };
    commit(tr("Putting devices into the site"), deviceIds, change, {});
}

/// On the runner. What is sent are the records as the service has them at that moment: those that the console
/// shows may be older than what another client has done.
DeviceActions::CommitResult DeviceActions::rebaseAndSend(ServiceSession &session,
                                                         const QStringList &deviceIds,
                                                         const std::function<Change(const JSON &)> &change) {
    CommitResult result;
    JSON present;
    result.code = DeviceCommit::readPresent(session, deviceIds, present);
    if (result.code != ApiOk) {
        qWarning("HTTP API(commitDevices) failed!");
        return result;
    }
    if (present.empty())
        return result;
    const Change made = change(present);
    result.isSent = true;
    result.code = DeviceCommit::send(session, made.records);
    result.message =
        joined({made.message, leftOutText(deviceIds.size() - static_cast<qsizetype>(present.size()))});
    return result;
}

void DeviceActions::commit(const QString &name, const QStringList &deviceIds,
                           std::function<Change(const JSON &)> change, std::function<void()> succeeded) {
    const auto known = notBegun();
    const bool started = ServiceRequest::post(
        NetJob::createRunner(qUtf8Printable(name)), this,
        [deviceIds, change, known](ServiceSession &session) {
            CommitResult result = rebaseAndSend(session, deviceIds, change);
            known->result = result.code;
            known->mayHaveBegun = result.isSent && session.isUnanswered();
            return result;
        },
        [this, name, succeeded](const CommitResult &result) {
            emit devicesChanged();
            // Only a refusal says for sure that nothing was done; an answer that is lost says nothing.
            if (result.code == ApiServerError || (result.code != ApiOk && !result.isSent))
                return emit failed(
                    tr("%1 failed: %2. Nothing was changed.").arg(name, apiResultText(result.code)));
            if (result.code != ApiOk)
                return emit failed(tr("%1 may have failed: %2. Look at the list before you try again.")
                                       .arg(name, apiResultText(result.code)));
            if (!result.isSent)
                return emit failed(tr("The devices are not managed any more."));
            emit done(result.message);
            if (succeeded)
                succeeded();
        },
        [this, name, known, count = deviceIds.size(),
         login = CLocalStore::instance().loginInfo()](JobOutcome end) {
            if (end == JobOutcome::SessionGone)
                reportSessionEnd(login, name, count, *known, {});
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                emit failed(failureText(name, end));
        });
    if (!started)
        emit failed(failureText(name, JobOutcome::NotRun));
}

void DeviceActions::exportList(const QString &path, const DeviceSnapshotPtr &devices,
                               const std::vector<int> &places) {
    emit working(tr("Exporting..."));
    auto *runner = NetJob::createRunner("exporting the device list", NetTask::Turn::Beside);
    const bool started = NetJob::post(
        runner, this, [path, devices, places] { return DeviceExport::write(path, *devices, places); },
        [this](const QString &error) {
            if (error.isEmpty())
                emit done(tr("Exported successfully!"));
            else
                emit failed(tr("The device list could not be exported: %1").arg(error));
        },
        [this](JobOutcome end) {
            if (end != JobOutcome::Delivered)
                emit failed(tr("The device list could not be exported."));
        });
    if (!started)
        emit failed(tr("The device list could not be exported."));
}

void DeviceActions::start(const PendingOperation &operation) {
    start(operation, NetJob::createRunner(qUtf8Printable(operation.title())), {});
}

void DeviceActions::start(const PendingOperation &operation, NetTask *runner,
                          const std::function<void()> &begun) {
    const auto known = notBegun();
    const bool started = ServiceRequest::post(
        runner, this,
        [operation, known, retry = retryFor(operation)](ServiceSession &session) {
            return *known = operation.run({session, operation.type, operation.deviceIds, retry});
        },
        [this, operation, begun](const DeviceOperations::Outcome &outcome) {
            if (outcome.tid.isEmpty())
                allowRetry(operation);
            const QString leftOut = leftOutText(outcome.missing.size());
            if (outcome.result != ApiOk)
                return emit failed(joined({failureText(operation.title(), outcome), leftOut}));
            if (!leftOut.isEmpty())
                emit failed(leftOut);
            if (begun)
                begun();
        },
        [this, operation, known, login = CLocalStore::instance().loginInfo()](JobOutcome end) {
            if (end == JobOutcome::SessionGone)
                reportSessionEnd(login, operation.title(), operation.deviceIds.size(), *known,
                                 [retry = retryFor(operation), ids = operation.deviceIds] {
                                     retry(QString()).again(ids);
                                 });
            if (end == JobOutcome::NotRun)
                allowRetry(operation);
            if (end == JobOutcome::NotRun || end == JobOutcome::Failed)
                emit failed(failureText(operation.title(), end));
        });
    if (!started)
        emit failed(failureText(operation.title(), JobOutcome::NotRun));
}

QString DeviceActions::PendingOperation::title() const {
    return TaskType::title(type);
}

/// The retry of the task that a failed retry was for.
void DeviceActions::allowRetry(const PendingOperation &operation) {
    if (!operation.retryOf.isEmpty())
        RetryRegistry::instance().remember(operation.retryOf, retryFor(operation)(operation.retryOf));
}

/// An operation with a password is not kept: its dialog asks for it again. Otherwise the new task is the one
/// to retry from then on, unless it cannot be made.
DeviceActions::Retry DeviceActions::retryFor(const PendingOperation &operation) {
    const QPointer actions(this);
    if (operation.needsInput)
        return [actions, type = operation.type](const QString &) {
            const auto ask = [actions, type](const QStringList &ids) {
                if (actions)
                    emit actions->inputNeeded(type, ids);
            };
            return RetryRegistry::Repeat{ask, true};
        };
    return [actions, operation](const QString &tid) {
        const auto again = [actions, operation, tid](const QStringList &ids) {
            RetryRegistry::instance().take(tid);
            if (actions)
                actions->start({operation.type, ids, operation.run, false, tid});
        };
        return RetryRegistry::Repeat{again, false};
    };
}
