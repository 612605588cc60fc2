#include "http/endpoint.h"
#include "service.h"

#include <charconv>

namespace emulator {

namespace {

std::int64_t timeMember(const Json &body, const char *name) {
    const std::string text = filledTextMember(body, name);
    std::int64_t time = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), time);
    if (error != std::errc() || end != text.data() + text.size() || time < 0)
        throw Refusal(Code::Malformed, std::string("\"") + name + "\" is no time");
    return time;
}

Answer listLog(Service &service, const Call &call) {
    const std::int64_t from = timeMember(call.body, "start_time");
    const std::int64_t to = timeMember(call.body, "end_time");
    return Answer::secret(service.withModel([&](Model &model) { return model.log.rangeText(from, to); }));
}

} // namespace

Endpoints logEndpoints() {
    return {{"POST", "/v1/logs/list", Role::Reader, &listLog}};
}

} // namespace emulator
