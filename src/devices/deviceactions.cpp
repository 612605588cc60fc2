#include "deviceactions.h"

#include "devicecommit.h"
#include "deviceexport.h"
#include "servicerequest.h"
#include "taskrepeats.h"
#include "tasktype.h"

#include <QPointer>

#include <nlohmann/json.hpp>

#include <algorithm>

struct DeviceActions::Change {
    JSON records = JSON::array();
    QString message;
};

namespace {

using SiteMembership::Outcome;

std::vector<std::string> recordTexts(const std::vector<DeviceRecordPtr> &devices) {
    std::vector<std::string> texts;
    for (const DeviceRecordPtr &device : devices)
        texts.push_back(device->json);
    return texts;
}

int countOf(const std::vector<SiteMembership::DeviceOutcome> &outcomes, Outcome outcome) {
    return static_cast<int>(
        std::count_if(outcomes.begin(), outcomes.end(), [outcome](const SiteMembership::DeviceOutcome &each) {
            return each.outcome == outcome;
        }));
}

QString busyText(const QString &name) {
    return DeviceActions::tr("%1 could not be started: the client is busy, try again.").arg(name);
}

} // namespace

void DeviceActions::restart(const QStringList &deviceIds) {
    start(TaskType::title(TaskType::restart), &DeviceOperations::restart, deviceIds);
}

void DeviceActions::deleteDevices(const std::vector<DeviceRecordPtr> &devices) {
    const auto change = [devices] {
        Change made{JSON::array(), tr("%n device(s) deleted.", nullptr, static_cast<int>(devices.size()))};
        for (const DeviceRecordPtr &device : devices) {
            qDebug("At device overview, remove device id directly: %s", qUtf8Printable(device->id));
            JSON record = parseJson(device->json);
            // A record without sites is how the service is told to forget a device.
            record["siteid"] = JSON::array();
            made.records.push_back(std::move(record));
        }
        return made;
    };
    commit(tr("Deleting devices"), change, [this] { emit devicesDeleted(); });
}

void DeviceActions::removeFromSite(const std::vector<DeviceRecordPtr> &devices, const QString &siteId) {
    const auto change = [records = recordTexts(devices), siteId] {
        Change made;
        const auto outcomes = SiteMembership::removeFromSite(records, siteId, made.records);
        made.message =
            tr("%n device(s) removed from the site.", nullptr, countOf(outcomes, Outcome::Removed));
        return made;
    };
    commit(tr("Removing devices from the site"), change, [this] { emit devicesDeleted(); });
}

void DeviceActions::putIntoSite(const std::vector<DeviceRecordPtr> &devices,
                                const SiteMembership::Drop &drop) {
    const auto change = [records = recordTexts(devices), drop] {
        Change made;
        const auto outcomes = SiteMembership::assign(records, drop, made.records);
        const int moved = countOf(outcomes, Outcome::Moved);
        const int added = countOf(outcomes, Outcome::Added);
        const int unreadable = countOf(outcomes, Outcome::Unreadable);
        QStringList parts;
        if (moved > 0)
            parts += tr("%n device(s) moved.", nullptr, moved);
        if (added > 0)
            parts += tr("%n device(s) added to the site.", nullptr, added);
        if (const int present = countOf(outcomes, Outcome::Unchanged); present > 0)
            parts += tr("%n device(s) in the site already.", nullptr, present);
        if (unreadable > 0)
            parts += tr("%n device record(s) could not be read.", nullptr, unreadable);
        made.message = parts.join(QLatin1Char(' '));
        return made;
    };
    commit(tr("Putting devices into the site"), change, {});
}

void DeviceActions::commit(const QString &name, std::function<Change()> change,
                           std::function<void()> succeeded) {
    struct Result {
        unsigned code;
        QString message;
    };
    const bool started = ServiceRequest::post(
        NetJob::createRunner(qUtf8Printable(name)), this,
        [change](ServiceSession &session) {
            const Change made = change();
            return Result{DeviceCommit::send(session, made.records), made.message};
        },
        [this, name, succeeded](const Result &result) {
            emit devicesChanged();
            // Only a refusal says for sure that nothing was done; an answer that is lost says nothing.
            if (result.code == ApiServerError)
                return emit failed(
                    tr("%1 failed: %2. Nothing was changed.").arg(name, apiResultText(result.code)));
            if (result.code != ApiOk)
                return emit failed(tr("%1 may have failed: %2. Look at the list before you try again.")
                                       .arg(name, apiResultText(result.code)));
            emit done(result.message);
            if (succeeded)
                succeeded();
        },
        [this, name](JobEnd end) {
            if (end == JobEnd::NotRun || end == JobEnd::Failed)
                emit failed(busyText(name));
        });
    if (!started)
        emit failed(busyText(name));
}

void DeviceActions::exportList(const QString &path, const DeviceSnapshotPtr &devices,
                               const std::vector<int> &places) {
    emit done(tr("Exporting..."));
    auto *runner = NetJob::createRunner("exporting the device list", NetTask::Turn::Beside);
    NetJob::post(
        runner, this, [path, devices, places] { return DeviceExport::write(path, *devices, places); },
        [this](const QString &error) {
            if (error.isEmpty())
                emit done(tr("Exported successfully!"));
            else
                emit failed(tr("The device list could not be exported: %1").arg(error));
        },
        [this](JobEnd end) {
            if (end != JobEnd::Delivered)
                emit failed(tr("The device list could not be exported."));
        });
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
                emit failed(busyText(name));
        });
    if (!started)
        emit failed(busyText(name));
}
