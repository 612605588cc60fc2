#include "endpoint.h"

namespace emulator {

namespace {

/// This service has no alarms to tell.
Answer listAlarms(Service &, const Call &call) {
    pageOf(call.body);
    return Answer::secret(R"({"items":[],"total_items":0})");
}

} // namespace

Endpoints alarmEndpoints() {
    return {{"POST", "/v1/alarm/list", Gate::Reader, &listAlarms}};
}

} // namespace emulator
