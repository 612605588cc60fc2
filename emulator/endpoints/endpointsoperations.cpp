#include "devices/addressassignment.h"
#include "devices/addressbook.h"
#include "devices/quicksetup.h"
#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tasks/taskwork.h"

namespace emulator {

namespace {

std::vector<Target> underTask(const std::vector<std::string> &ids, const std::string &taskId) {
    std::vector<Target> targets;
    for (const std::string &id : ids)
        targets.push_back({id, taskId});
    return targets;
}

Response assignAutomatically(Service &service, const Call &call) {
    const auto targets = underTask(idsOf(targetsOf(call.body)), filledTextMember(call.body, "tid"));
    service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        AddressBook addresses(model);
        startUnderTasks(model, targets, "deviceAssignIPAuto",
                        [&](const Device &device) { return automaticAddress(device, addresses); });
    });
    return {};
}

Response assignByHand(Service &service, const Call &call) {
    const AddressAssignment assignment(call.body);
    const auto targets = underTask(assignment.deviceIds(), filledTextMember(call.body, "tid"));
    service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        AddressBook addresses(model);
        startUnderTasks(model, targets, "deviceAssignIPManual",
                        [&](const Device &device) { return assignment.workOf(device, addresses); });
    });
    return {};
}

Response setUpQuickly(Service &service, const Call &call) {
    const auto targets = targetsOf(call.body);
    DeviceWork work;
    work.changes = quickSetupChanges(call.body, nowMs());
    order(service, targets, "deviceQuickSetup", [&](const Device &) { return work; });
    return {};
}

} // namespace

Endpoints operationEndpoints() {
    return {
        {"POST", "/v1/assip/auto", Role::Writer, &assignAutomatically},
        {"POST", "/v1/assip/manual", Role::Writer, &assignByHand},
        {"POST", "/v1/quicksetup", Role::Writer, &setUpQuickly},
    };
}

} // namespace emulator
