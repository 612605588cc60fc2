#include "http/endpoint.h"
#include "service.h"

namespace emulator {

namespace {

Answer listAlarms(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    return Answer::secret(service.withModel([&](Model &model) { return model.alarms.pageText(page); }));
}

Answer removeAlarms(Service &service, const Call &call) {
    const auto ids = textsMember(call.body, "alids");
    service.withModel([&](Model &model) { model.alarms.remove(ids); });
    return {};
}

} // namespace

Endpoints alarmEndpoints() {
    return {
        {"POST", "/v1/alarm/list", Role::Reader, &listAlarms},
        {"POST", "/v1/alarm/rm", Role::Writer, &removeAlarms},
    };
}

} // namespace emulator
