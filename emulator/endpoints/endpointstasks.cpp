#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"

namespace emulator {

namespace {

Answer newTask(Service &service, const Call &call) {
    const std::string type = filledTextMember(call.body, "type");
    const Json &devices = arrayMember(call.body, "devices");
    return Answer::secret(service.withModel([&](Model &model) {
        return TaskTable::text(model.engine.create(type, call.session.account, devices, nowMs()));
    }));
}

Answer listTasks(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    return Answer::secret(service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        return model.tasks.pageText(page);
    }));
}

Answer removeTasks(Service &service, const Call &call) {
    const auto ids = textsMember(call.body, "tids");
    service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        model.engine.remove({ids.begin(), ids.end()});
    });
    return {};
}

Answer endTask(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "task_id");
    const std::string state = filledTextMember(call.body, "task_state");
    service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        model.engine.close(id, state, nowMs());
    });
    return {};
}

} // namespace

Endpoints taskEndpoints() {
    return {
        {"POST", "/v1/task/init", Role::Writer, &newTask},
        {"POST", "/v1/task/list", Role::Reader, &listTasks},
        {"POST", "/v1/task/rm", Role::Writer, &removeTasks},
        {"POST", "/v1/task/updateState", Role::Writer, &endTask},
    };
}

} // namespace emulator
