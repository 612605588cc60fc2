#include "platform/json.h"

#include "platform/elementtexts.h"

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

constexpr std::string_view blanks = " \t\r\n";

std::string_view trimmed(std::string_view text) {
    const std::size_t begin = text.find_first_not_of(blanks);
    return begin == std::string_view::npos ? std::string_view()
                                           : text.substr(begin, text.find_last_not_of(blanks) - begin + 1);
}

} // namespace

JSON parseJson(std::string_view text) {
    requireBounds(text);
    return JSON::parse(text);
}

std::vector<std::string_view> elementTexts(std::string_view array) {
    const std::string_view text = trimmed(array);
    if (text.size() < 2 || text.front() != '[' || text.back() != ']')
        throw std::invalid_argument("JSON is no array");
    const std::string_view inner = trimmed(text.substr(1, text.size() - 2));
    std::vector<std::string_view> elements;
    int depth = 0;
    std::size_t begin = 0;
    for (std::size_t at = 0; at < inner.size(); ++at) {
        const char c = inner[at];
        if (c == '"') {
            at = endOfString(inner, at + 1);
        } else if (c == '[' || c == '{') {
            ++depth;
        } else if ((c == ']' || c == '}') && --depth < 0) {
            throw std::invalid_argument("JSON is no array");
        } else if (c == ',' && depth == 0) {
            elements.push_back(trimmed(inner.substr(begin, at - begin)));
            begin = at + 1;
        }
    }
    if (depth != 0)
        throw std::invalid_argument("JSON is no array");
    if (!inner.empty())
        elements.push_back(trimmed(inner.substr(begin)));
    return elements;
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
