#include "devices/debugexport.h"
#include "devices/deviceconfiguration.h"
#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tasks/taskwork.h"

namespace emulator {

namespace {

Response queryConfiguration(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "deviceid");
    return Response::plain(service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        const Device &device = model.devices.get(id);
        if (!device.reachable || !isPermitted(device, Access::Authorized))
            throw Refusal(Code::NoDeviceResponse, "device " + id + " does not report its configuration");
        return jsonText(configurationOf(device));
    }));
}

Response applyTemplate(Service &service, const Call &call) {
    const auto targets = targetsOf(call.body);
    DeviceWork work;
    work.changes = templateChanges(filledTextMember(call.body, "template"));
    order(service, targets, "deviceSetTemplate", [&](const Device &) { return work; });
    return {};
}

/// The caller names a folder of its own machine; the export waits here until it is fetched.
Response startExport(Service &service, const Call &call) {
    textMember(call.body, "storepath");
    order(service, targetsOf(call.body), "deviceExportDeviceInfo",
          [](const Device &) { return DeviceWork(); });
    return {};
}

Response fetchExport(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "tid");
    return Response::file(service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        return debugExport(model, model.tasks.get(id));
    }));
}

} // namespace

Endpoints configurationEndpoints() {
    return {
        {"POST", "/v1/config/query", Role::Reader, &queryConfiguration},
        {"POST", "/v1/config/config", Role::Writer, &applyTemplate},
    };
}

Endpoints exportEndpoints() {
    return {
        {"POST", "/v1/export/debif", Role::Writer, &startExport},
        {"POST", "/v1/export/file", Role::Reader, &fetchExport},
    };
}

} // namespace emulator
