#include "base/ipv4.h"

namespace Ipv4 {

std::optional<std::uint32_t> parse(std::string_view text) {
    constexpr int partCount = 4;
    constexpr int maxDigits = 3;
    std::uint32_t address = 0;
    std::uint32_t number = 0;
    int parts = 0;
    int digits = 0;
    for (std::size_t i = 0; i <= text.size(); ++i) {
        if (i == text.size() || text[i] == '.') {
            if (digits == 0 || number > 255 || ++parts > partCount)
                return std::nullopt;
            address = address << 8 | number;
            number = 0;
            digits = 0;
        } else if (text[i] >= '0' && text[i] <= '9' && ++digits <= maxDigits) {
            number = number * 10 + static_cast<std::uint32_t>(text[i] - '0');
        } else {
            return std::nullopt;
        }
    }
    return parts == partCount ? std::optional(address) : std::nullopt;
}

std::string toText(std::uint32_t address) {
    std::string text;
    for (int shift = 24; shift >= 0; shift -= 8)
        text += std::to_string(address >> shift & 255) + (shift > 0 ? "." : "");
    return text;
}

bool isMask(std::uint32_t address) {
    const std::uint32_t zeros = ~address;
    return address != 0 && zeros != 0 && (zeros & (zeros + 1)) == 0;
}

} // namespace Ipv4
