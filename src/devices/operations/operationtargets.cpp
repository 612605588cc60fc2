#include "devices/operations/operationtargets.h"

#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"

#include <QCoreApplication>

namespace OperationTargets {

namespace {

QHash<QString, QString> busyDevices(const TaskList &tasks) {
    QHash<QString, QString> busy;
    for (const TaskRecordPtr &task : tasks.records()) {
        if (task->isFinal())
            continue;
        for (const TaskDevice &device : task->devices) {
            if (!TaskState::isFinal(device.state))
                busy.insert(device.target->id, TaskType::title(task->type));
        }
    }
    return busy;
}

bool isAuthorized(DeviceStatusCode status, Need need) {
    return status == DeviceStatusCode::Authorized || status == DeviceStatusCode::Maintaining ||
           (status == DeviceStatusCode::SetPassword && need == Need::Account);
}

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(OperationTargets)
};

/// Adds a warning for the targets that the test holds of, if there are any.
template <typename Test>
void warn(std::vector<TargetWarning> &warnings, const List &targets, Test test,
          std::function<QString(int)> summary, const QString &note) {
    std::vector<int> places;
    for (std::size_t i = 0; i < targets.size(); ++i) {
        if (test(targets[i]))
            places.push_back(static_cast<int>(i));
    }
    if (!places.empty())
        warnings.push_back({std::move(summary), note, std::move(places)});
}

} // namespace

List of(const std::vector<DeviceRecordPtr> &devices, const DeviceInventory &inventory,
        const TaskList &tasks) {
    const QHash<QString, QString> busy = busyDevices(tasks);
    List targets;
    for (const DeviceRecordPtr &device : devices) {
        const int place = inventory.snapshot()->indexOf(device->id);
        targets.push_back({device, place < 0 ? DeviceStatusCode::Unreachable : inventory.status(place),
                           busy.value(device->id)});
    }
    return targets;
}

std::vector<TargetWarning> warnings(const List &targets, Need need) {
    std::vector<TargetWarning> found;
    warn(
        found, targets,
        [](const OperationTarget &target) { return target.status == DeviceStatusCode::Unreachable; },
        [](int count) { return Texts::tr("%n device(s) will fail: not reachable.", nullptr, count); },
        Texts::tr("Unreachable"));
    if (need != Need::Connection)
        warn(
            found, targets,
            [need](const OperationTarget &target) {
                return target.status != DeviceStatusCode::Unreachable && !isAuthorized(target.status, need);
            },
            [](int count) { return Texts::tr("%n device(s) will fail: not authorized.", nullptr, count); },
            Texts::tr("Not authorized"));
    warn(
        found, targets,
        [](const OperationTarget &target) {
            return !target.busyWith.isEmpty() || target.status == DeviceStatusCode::Maintaining;
        },
        [](int count) { return Texts::tr("%n device(s) at work for another task.", nullptr, count); },
        Texts::tr("Busy"));
    return found;
}

std::vector<TargetWarning> withStatus(const List &targets, const std::vector<StatusWarning> &warnings) {
    std::vector<TargetWarning> found;
    for (const StatusWarning &each : warnings)
        warn(
            found, targets, [&](const OperationTarget &target) { return target.status == each.status; },
            each.summary, each.note);
    return found;
}

} // namespace OperationTargets
