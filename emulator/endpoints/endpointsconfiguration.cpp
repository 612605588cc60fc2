#include "devices/deviceconfiguration.h"
#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tasks/workorders.h"

namespace emulator {

namespace {

Answer queryConfiguration(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "deviceid");
    return Answer::plain(service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        const Device &device = model.devices.get(id);
        if (!device.reachable || !isPermitted(device, Access::Authorized))
            throw Refusal(Code::NoDeviceAnswer, "device " + id + " does not tell its configuration");
        return jsonText(configurationOf(device));
    }));
}

Answer applyTemplate(Service &service, const Call &call) {
    const auto targets = targetsOf(call.body);
    DeviceWork work;
    work.changes = templateChanges(filledTextMember(call.body, "template"));
    order(service, targets, "deviceSetTemplate", [&](const Device &) { return work; });
    return {};
}

} // namespace

Endpoints configurationEndpoints() {
    return {
        {"POST", "/v1/config/query", Role::Reader, &queryConfiguration},
        {"POST", "/v1/config/config", Role::Writer, &applyTemplate},
    };
}

} // namespace emulator
