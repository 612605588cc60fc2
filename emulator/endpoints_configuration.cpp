#include "clock.h"
#include "device_configuration.h"
#include "endpoint.h"
#include "service.h"
#include "work_orders.h"

namespace emulator {

namespace {

Answer queryConfiguration(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "deviceid");
    return Answer::plain(service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        const Device &device = model.devices.get(id);
        if (!device.reachable || !obeys(device, Access::Authorized)) {
            throw Refusal(Code::NoDeviceAnswer, "device " + id + " does not tell its configuration");
        }
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
        {"POST", "/v1/config/query", Gate::Reader, &queryConfiguration},
        {"POST", "/v1/config/config", Gate::Writer, &applyTemplate},
    };
}

} // namespace emulator
