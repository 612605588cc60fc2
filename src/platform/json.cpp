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

std::string_view textMember(const JSON &object, const char *name) {
    if (!object.is_object())
        return {};
    const auto found = object.find(name);
    return found != object.end() && found->is_string() ? found->get_ref<const std::string &>()
                                                       : std::string_view();
}

QString stringMember(const JSON &object, const char *name) {
    const std::string_view text = textMember(object, name);
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}
