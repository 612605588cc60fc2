#include "tasks/workorders.h"

#include "http/answer.h"
#include "service.h"
#include "simulation/clock.h"

#include <map>
#include <string>

namespace emulator {

namespace {

DeviceWork workOn(const Model &model, const std::string &id, const WorkFor &workFor) {
    const Device *device = model.devices.find(id);
    DeviceWork work = device ? workFor(*device) : DeviceWork();
    work.id = id;
    return work;
}

void checkType(const Model &model, const std::string &taskId, std::string_view type) {
    if (!type.empty() && model.tasks.get(taskId).type != type)
        throw Refusal(Code::Malformed, "the task is for something else");
}

} // namespace

void startUnderTasks(Model &model, const std::vector<Target> &targets, std::string_view type,
                     const WorkFor &workFor) {
    std::map<std::string, std::vector<DeviceWork>> works;
    for (const Target &target : targets)
        if (!target.taskId.empty())
            works[target.taskId].push_back(workOn(model, target.id, workFor));
    for (const auto &[taskId, work] : works) {
        checkType(model, taskId, type);
        model.engine.judgeWork(taskId, work);
    }
    for (const auto &[taskId, work] : works)
        model.engine.startWork(taskId, work, nowMs());
}

Outcome doAtOnce(Model &model, Device &device, const DeviceWork &work) {
    if (!device.reachable)
        return Outcome::NoConnection;
    if (!isPermitted(device, work.access))
        return Outcome::NotAuthorized;
    if (!work.failure.empty())
        return Outcome::Failed;
    apply(model.devices, device, work);
    return Outcome::Done;
}

void doAtOnce(Model &model, const std::vector<Target> &targets, const WorkFor &workFor) {
    Transaction transaction(model.store.database());
    for (const Target &target : targets) {
        if (target.taskId.empty()) {
            Device &device = model.devices.get(target.id);
            doAtOnce(model, device, workFor(device));
        }
    }
    transaction.commit();
}

void order(Service &service, const std::vector<Target> &targets, std::string_view type,
           const WorkFor &workFor) {
    service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        checkKnownWithoutTask(model, targets);
        startUnderTasks(model, targets, type, workFor);
        doAtOnce(model, targets, workFor);
    });
}

void checkKnownWithoutTask(const Model &model, const std::vector<Target> &targets) {
    for (const Target &target : targets)
        if (target.taskId.empty())
            model.devices.get(target.id);
}

} // namespace emulator
