#include "devices/operations/rollout/rolloutrecords.h"

#include "tasks/service/tasktargets.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <stdexcept>

namespace RolloutRecords {

namespace {

QStringList idsIn(const JSON &object, const char *name) {
    QStringList ids;
    for (const JSON &id : object.at(name))
        ids += QString::fromStdString(id.get<std::string>());
    return ids;
}

JSON planJson(const RolloutPlan &plan) {
    return {{"path", plan.image.path.toStdString()},
            {"name", plan.image.name.toStdString()},
            {"size", plan.image.size},
            {"changed_at", plan.image.changedAt},
            {"fwid", plan.fwid.toStdString()},
            {"actm", plan.actionTime.toStdString()},
            {"devices", TaskTargets::ids(plan.deviceIds)},
            {"first", plan.firstCount},
            {"wait", plan.waitMinutes},
            {"most_failed", plan.maxFailedPercent}};
}

RolloutPlan planOf(const JSON &object) {
    RolloutPlan plan;
    plan.image.path = stringMember(object, "path");
    plan.image.name = stringMember(object, "name");
    plan.image.size = object.at("size").get<qint64>();
    plan.image.changedAt = object.at("changed_at").get<qint64>();
    plan.fwid = stringMember(object, "fwid");
    plan.actionTime = stringMember(object, "actm");
    plan.deviceIds = idsIn(object, "devices");
    plan.firstCount = object.at("first").get<int>();
    plan.waitMinutes = object.at("wait").get<int>();
    plan.maxFailedPercent = object.at("most_failed").get<int>();
    return plan;
}

JSON waveJson(const Rollout::Wave &wave) {
    return {{"devices", TaskTargets::ids(wave.deviceIds)},
            {"tid", wave.tid.toStdString()},
            {"earlier_tids", TaskTargets::ids(wave.earlierTids)},
            {"seen", wave.isSeen},
            {"scheduled_at", wave.scheduledAt},
            {"done", wave.done},
            {"failed", wave.failed}};
}

Rollout::Wave waveOf(const JSON &object) {
    return {idsIn(object, "devices"),
            {},
            stringMember(object, "tid"),
            object.contains("earlier_tids") ? idsIn(object, "earlier_tids") : QStringList(),
            object.at("seen").get<bool>(),
            object.at("scheduled_at").get<qint64>(),
            object.at("done").get<int>(),
            object.at("failed").get<int>()};
}

JSON progressJson(const Rollout::Progress &progress) {
    return {{"state", static_cast<int>(progress.state)},
            {"stopped_in", static_cast<int>(progress.stoppedIn)},
            {"reason", static_cast<int>(progress.reason)},
            {"reason_text", progress.reasonText.toStdString()},
            {"wave", waveJson(progress.wave)},
            {"earlier_done", progress.earlierDone},
            {"earlier_failed", progress.earlierFailed},
            {"wait_until", progress.waitUntil}};
}

/// A value of an enumeration whose last one is given; throws for any other number.
template <typename Value>
Value valueOf(const JSON &object, const char *name, Value last) {
    const int number = object.at(name).get<int>();
    if (number < 0 || number > static_cast<int>(last))
        throw std::out_of_range(name);
    return static_cast<Value>(number);
}

Rollout::Progress progressOf(const JSON &object) {
    return {valueOf(object, "state", Rollout::State::Done),
            valueOf(object, "stopped_in", Rollout::State::Done),
            valueOf(object, "reason", Rollout::Reason::NotBegun),
            stringMember(object, "reason_text"),
            waveOf(object.at("wave")),
            object.at("earlier_done").get<int>(),
            object.at("earlier_failed").get<int>(),
            object.at("wait_until").get<qint64>()};
}

} // namespace

QString toText(const std::vector<Record> &records) {
    JSON list = JSON::array();
    for (const Record &record : records)
        list.push_back({{"plan", planJson(*record.plan)}, {"progress", progressJson(record.progress)}});
    return QString::fromStdString(dumpJson(list));
}

std::vector<Record> parse(const QString &text) {
    std::vector<Record> records;
    if (text.isEmpty())
        return records;
    try {
        for (const JSON &each : parseJson(text.toStdString())) {
            try {
                records.push_back({std::make_shared<const RolloutPlan>(planOf(each.at("plan"))),
                                   progressOf(each.at("progress"))});
            } catch (const std::exception &error) {
                qWarning("A stored rollout cannot be read: %s", error.what());
            }
        }
    } catch (const std::exception &error) {
        qWarning("The stored rollouts cannot be read: %s", error.what());
    }
    return records;
}

} // namespace RolloutRecords
