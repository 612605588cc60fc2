#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"

#include <charconv>

namespace emulator {

namespace {

Response newTask(Service &service, const Call &call) {
    const std::string type = filledTextMember(call.body, "type");
    const Json &devices = arrayMember(call.body, "devices");
    return Response::secret(service.withModel([&](Model &model) {
        return TaskTable::text(model.engine.create(type, call.session.account, devices, nowMs()));
    }));
}

Response listTasks(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    return Response::secret(service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        return model.tasks.pageText(page);
    }));
}

Response removeTasks(Service &service, const Call &call) {
    const auto ids = textsMember(call.body, "tids");
    service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        model.engine.remove({ids.begin(), ids.end()});
    });
    return {};
}

Response endTask(Service &service, const Call &call) {
    const std::string id = filledTextMember(call.body, "task_id");
    const std::string state = filledTextMember(call.body, "task_state");
    service.withModel([&](Model &model) {
        model.engine.settle(nowMs());
        model.engine.close(id, state, nowMs());
    });
    return {};
}

Response listAlarms(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    return Response::secret(service.withModel([&](Model &model) { return model.alarms.pageText(page); }));
}

Response removeAlarms(Service &service, const Call &call) {
    const auto ids = textsMember(call.body, "alids");
    service.withModel([&](Model &model) { model.alarms.remove(ids); });
    return {};
}

std::int64_t timeMember(const Json &body, const char *name) {
    const std::string text = filledTextMember(body, name);
    std::int64_t time = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), time);
    if (error != std::errc() || end != text.data() + text.size() || time < 0)
        throw Refusal(Code::Malformed, std::string("\"") + name + "\" is no time");
    return time;
}

Response listLog(Service &service, const Call &call) {
    const std::int64_t from = timeMember(call.body, "start_time");
    const std::int64_t to = timeMember(call.body, "end_time");
    return Response::secret(service.withModel([&](Model &model) { return model.log.rangeText(from, to); }));
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

Endpoints alarmEndpoints() {
    return {
        {"POST", "/v1/alarm/list", Role::Reader, &listAlarms},
        {"POST", "/v1/alarm/rm", Role::Writer, &removeAlarms},
    };
}

Endpoints logEndpoints() {
    return {{"POST", "/v1/logs/list", Role::Reader, &listLog}};
}

} // namespace emulator
