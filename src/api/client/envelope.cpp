#include "api/client/envelope.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <string>

namespace {

constexpr std::string_view blanks = " \t\r\n";

/// The content of the string that begins at a quote; nothing when it holds more than plain ASCII letters, or
/// does not end. Moves the position behind it.
std::optional<std::string_view> takePlainString(std::string_view text, std::size_t &at) {
    const std::size_t end = text.find('"', at + 1);
    if (end == std::string_view::npos)
        return std::nullopt;
    const std::string_view content = text.substr(at + 1, end - at - 1);
    at = end + 1;
    // Without a way out of the loop the compiler looks at many letters at a time.
    int others = 0;
    for (const char c : content)
        others |= static_cast<int>(c < ' ') | static_cast<int>(c == '\x7f') | static_cast<int>(c == '\\');
    return others == 0 ? std::optional(content) : std::nullopt;
}

/// The text of the member "data" of the outermost object. Nothing when anything about it is unusual; then the
/// parser decides about the whole.
std::optional<std::string_view> findData(std::string_view text) {
    std::optional<std::string_view> data;
    int depth = 0;
    for (std::size_t at = 0; at < text.size();) {
        const char c = text[at];
        if (c != '"') {
            depth += c == '{' || c == '[' ? 1 : c == '}' || c == ']' ? -1 : 0;
            ++at;
            continue;
        }
        const std::optional<std::string_view> string = takePlainString(text, at);
        if (!string)
            return std::nullopt;
        const std::size_t colon = text.find_first_not_of(blanks, at);
        if (depth != 1 || string != "data" || colon >= text.size() || text[colon] != ':')
            continue;
        at = std::min(text.find_first_not_of(blanks, colon + 1), text.size());
        if (data || at == text.size() || text[at] != '"' || !(data = takePlainString(text, at)))
            return std::nullopt;
    }
    return data;
}

} // namespace

Envelope Envelope::open(std::string_view answer) {
    const std::optional<std::string_view> data = findData(answer);
    if (!data)
        return {parseJson(answer), std::nullopt};
    const auto begin = static_cast<std::size_t>(data->data() - answer.data());
    std::string rest(answer.substr(0, begin));
    rest += answer.substr(begin + data->size());
    return {parseJson(rest), data};
}
