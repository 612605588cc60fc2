#include "json.h"

#include <nlohmann/json.hpp>

#include <stdexcept>

namespace {

constexpr int depthLimit = 64;
/// A value takes some 80 bytes of memory, however short its text is.
constexpr std::size_t valueLimit = 5'000'000;

/// The place of the quote that ends the string whose content begins at the given place.
std::size_t endOfString(std::string_view text, std::size_t from) {
    for (std::size_t at = from; at < text.size(); ++at) {
        if (text[at] == '"')
            return at;
        if (text[at] == '\\')
            ++at;
    }
    return text.size();
}

/// In one pass before parsing: with a callback in the parser, the library walks all siblings at the end of
/// every object. Text that is not JSON is left to the parser.
void requireBounds(std::string_view text) {
    int depth = 0;
    std::size_t values = 1;
    for (std::size_t at = 0; at < text.size(); ++at) {
        switch (text[at]) {
        case '"':
            at = endOfString(text, at + 1);
            break;
        case '[':
        case '{':
            if (++depth > depthLimit)
                throw std::length_error("JSON is nested too deeply");
            ++values;
            break;
        case ']':
        case '}':
            --depth;
            break;
        case ',':
            ++values;
            break;
        default:
            break;
        }
    }
    if (values > valueLimit)
        throw std::length_error("JSON holds too many values");
}

} // namespace

JSON parseJson(std::string_view text) {
    requireBounds(text);
    return JSON::parse(text);
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
