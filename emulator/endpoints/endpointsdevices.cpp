#include "devices/devicecommit.h"
#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tables/credentials.h"
#include "tasks/taskwork.h"

#include <charconv>

namespace emulator {

namespace {

int policyMask(const Json &body) {
    const std::string text = textMember(body, "type");
    int mask = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), mask);
    if (error != std::errc() || end != text.data() + text.size() || mask < 0)
        throw Refusal(Code::Malformed, "\"type\" is no mask");
    return mask;
}

Response listDevices(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    return Response::secret(service.withModel([&](Model &model) {
        model.authorization.settle(nowMs());
        model.engine.settle(nowMs());
        return model.devices.pageText(page);
    }));
}

Response listStatuses(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    return Response::secret(service.withModel([&](Model &model) {
        model.authorization.settle(nowMs());
        model.engine.settle(nowMs());
        return model.devices.statusText(page);
    }));
}

Response commitDeviceList(Service &service, const Call &call) {
    const std::string stage = textMember(call.body, "state");
    const Json &devices = arrayMember(call.body, "devices");
    service.withModel([&](Model &model) {
        const auto records = model.batches.take("devices " + call.session.session, stage, devices, nowMs());
        if (records)
            commitDevices(model, *records);
    });
    return {};
}

void checkTimeout(const Json &body) {
    if (integerMember(body, "timeout") <= 0)
        throw Refusal(Code::Malformed, "\"timeout\" must be positive");
}

Response scan(Service &service, const Call &call) {
    checkTimeout(call.body);
    service.withModel([](Model &model) { model.scans.start(nowMs()); });
    return {};
}

Response scanAddress(Service &service, const Call &call) {
    checkTimeout(call.body);
    const std::string address = filledTextMember(call.body, "ip");
    service.withModel([&](Model &model) { model.scans.startAddress(address, nowMs()); });
    return {};
}

Response scanRange(Service &service, const Call &call) {
    checkTimeout(call.body);
    const std::string first = filledTextMember(call.body, "ip_start");
    const std::string last = filledTextMember(call.body, "ip_end");
    service.withModel([&](Model &model) { model.scans.startRange(first, last, nowMs()); });
    return {};
}

Response scanResults(Service &service, const Call &) {
    return Response::secret(service.withModel([](Model &model) { return model.scans.foundText(nowMs()); }));
}

Response setPolicy(Service &service, const Call &call) {
    auto targets = targetsOf(call.body);
    DeviceWork work;
    work.changes["d_policy"] = {{"plen", integerMember(call.body, "plen")}, {"type", policyMask(call.body)}};
    const std::string taskId = optionalText(call.body, "tid");
    for (Target &target : targets)
        target.taskId = target.taskId.empty() ? taskId : target.taskId;
    order(service, targets, "devicePassPolicy", [&](const Device &) { return work; });
    return {};
}

Response authorize(Service &service, const Call &call) {
    const auto targets = targetsOf(call.body);
    const std::string account = filledTextMember(call.body, "acc");
    const auto password = plainPassword(textMember(call.body, "pass"));
    if (!password)
        throw Refusal(Code::Malformed, "\"pass\" does not decipher");
    service.withModel([&](Model &model) {
        checkKnown(model, targets);
        std::vector<std::string> ids;
        for (const Target &target : targets)
            ids.push_back(target.id);
        model.authorization.request(ids, account, *password, nowMs());
    });
    return {};
}

} // namespace

Endpoints deviceEndpoints() {
    return {
        {"POST", "/v1/dev/list", Role::Reader, &listDevices},
        {"POST", "/v1/dstatus/list", Role::Reader, &listStatuses},
        {"POST", "/v1/dev/commit", Role::Writer, &commitDeviceList},
        {"POST", "/v1/dev/scan", Role::Writer, &scan},
        {"POST", "/v1/dev/scanip", Role::Writer, &scanAddress},
        {"POST", "/v1/dev/scanips", Role::Writer, &scanRange},
        {"POST", "/v1/dev/scanout", Role::Reader, &scanResults},
        {"POST", "/v1/dev/setpolicy", Role::Writer, &setPolicy},
        {"POST", "/v1/dev/auth", Role::Writer, &authorize},
    };
}

} // namespace emulator
