#include "json.h"

#include <nlohmann/json.hpp>

#include <stdexcept>

namespace {
constexpr int depthLimit = 64;
} // namespace

JSON parseJson(std::string_view text) {
    const auto refuseDepth = [](int depth, JSON::parse_event_t, JSON &) {
        if (depth > depthLimit)
            throw std::length_error("JSON is nested too deeply");
        return true;
    };
    return JSON::parse(text, refuseDepth);
}

std::string dumpJson(const JSON &value) {
    return value.dump(-1, ' ', false, JSON::error_handler_t::replace);
}
