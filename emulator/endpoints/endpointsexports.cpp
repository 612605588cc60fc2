#include "devices/debugexport.h"
#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tasks/workorders.h"

namespace emulator {

namespace {

/// The place that the caller names is one of its own machine; the export waits here until it is fetched.
Answer startExport(Service &service, const Call &call) {
    textMember(call.body, "storepath");
    order(service, targetsOf(call.body), "deviceExportDeviceInfo",
          [](const Device &) { return DeviceWork(); });
    return {};
}

Answer fetchExport(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "tid");
    return Answer::file(service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        return debugExport(model, model.tasks.get(id));
    }));
}

} // namespace

Endpoints exportEndpoints() {
    return {
        {"POST", "/v1/export/debif", Role::Writer, &startExport},
        {"POST", "/v1/export/file", Role::Reader, &fetchExport},
    };
}

} // namespace emulator
