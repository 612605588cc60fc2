#include "endpoint.h"

namespace emulator {

namespace {

/// This service has no tasks to speak of.
Answer listTasks(Service &, const Call &call) {
    pageOf(call.body);
    return Answer::secret("[]");
}

} // namespace

Endpoints taskEndpoints() {
    return {{"POST", "/v1/task/list", Gate::Reader, &listTasks}};
}

} // namespace emulator
