#include "base/macaddress.h"

#include <charconv>

namespace MacAddress {

std::string digits(std::string_view text) {
    std::string digits;
    for (const char c : text) {
        if (c == ':' || c == '-' || c == '.' || c == ' ')
            continue;
        if ((c >= '0' && c <= '9') || (c >= 'A' && c <= 'F'))
            digits += c;
        else if (c >= 'a' && c <= 'f')
            digits += static_cast<char>(c - 'a' + 'A');
        else
            return {};
    }
    return digits;
}

std::string plain(std::string_view text) {
    constexpr std::size_t digitCount = 12;
    std::string all = digits(text);
    return all.size() == digitCount ? all : std::string();
}

std::optional<std::uint64_t> parse(std::string_view text) {
    const std::string all = plain(text);
    std::uint64_t address = 0;
    if (std::from_chars(all.data(), all.data() + all.size(), address, 16).ec != std::errc())
        return std::nullopt;
    return address;
}

} // namespace MacAddress
