#include "http/jsonaccess.h"

#include "http/response.h"

#include <algorithm>

namespace emulator {

namespace {

constexpr int deepest = 64;
constexpr std::int64_t maxPageSize = 2000;

/// Copying and writing a JSON value recurse, so the nesting is bounded before anything is built.
bool nestsTooDeeply(std::string_view text) {
    int depth = 0;
    bool quoted = false;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char c = text[i];
        if (quoted) {
            i += c == '\\' ? 1 : 0;
            quoted = c != '"';
        } else if (c == '"') {
            quoted = true;
        } else if (c == '[' || c == '{') {
            if (++depth > deepest)
                return true;
        } else if (c == ']' || c == '}') {
            --depth;
        }
    }
    return false;
}

[[noreturn]] void refuseMember(const char *name) {
    throw Refusal(Code::Malformed, std::string("member \"") + name + "\" is missing or of a wrong type");
}

} // namespace

Json parseJson(std::string_view text) {
    if (nestsTooDeeply(text))
        throw Refusal(Code::Malformed, "the body nests too deeply");
    Json value = Json::parse(text, nullptr, false);
    if (value.is_discarded())
        throw Refusal(Code::Malformed, "the body is not JSON");
    return value;
}

std::string jsonText(const Json &value) {
    return value.dump(-1, ' ', false, Json::error_handler_t::replace);
}

const Json &member(const Json &object, const char *name) {
    const auto found = object.find(name);
    if (found == object.end())
        refuseMember(name);
    return *found;
}

std::string textMember(const Json &object, const char *name) {
    const Json &value = member(object, name);
    if (!value.is_string())
        refuseMember(name);
    return value.get<std::string>();
}

std::string filledTextMember(const Json &object, const char *name) {
    std::string text = textMember(object, name);
    if (text.empty())
        refuseMember(name);
    return text;
}

std::int64_t integerMember(const Json &object, const char *name) {
    const Json &value = member(object, name);
    if (!value.is_number_integer())
        refuseMember(name);
    return value.get<std::int64_t>();
}

const Json &arrayMember(const Json &object, const char *name) {
    const Json &value = member(object, name);
    if (!value.is_array())
        refuseMember(name);
    return value;
}

std::vector<std::string> textsMember(const Json &body, const char *name) {
    std::vector<std::string> texts;
    for (const Json &element : arrayMember(body, name)) {
        if (!element.is_string())
            throw Refusal(Code::Malformed, std::string("\"") + name + "\" holds something else than texts");
        texts.push_back(element.get<std::string>());
    }
    return texts;
}

std::string optionalText(const Json &object, const char *name) {
    const auto found = object.find(name);
    if (found == object.end() || found->is_null())
        return {};
    return textMember(object, name);
}

Page pageOf(const Json &body) {
    const std::int64_t start = integerMember(body, "start");
    const std::int64_t count = integerMember(body, "count");
    if (start < 0)
        refuseMember("start");
    if (count < 0)
        refuseMember("count");
    return {static_cast<std::size_t>(start), static_cast<std::size_t>(std::min(count, maxPageSize))};
}

} // namespace emulator
