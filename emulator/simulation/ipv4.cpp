#include "simulation/ipv4.h"

#include <charconv>

namespace emulator {

std::optional<std::uint32_t> addressNumber(const std::string &text) {
    std::uint32_t number = 0;
    const char *at = text.data();
    const char *const end = at + text.size();
    for (int part = 0; part < 4; ++part) {
        // Some parsers read a leading zero as octal, so none is accepted.
        const bool isPadded = end - at > 1 && at[0] == '0' && at[1] >= '0' && at[1] <= '9';
        std::uint8_t value = 0;
        const auto [rest, error] = std::from_chars(at, end, value);
        const bool isFollowed = part == 3 ? rest == end : rest != end && *rest == '.';
        if (error != std::errc() || isPadded || !isFollowed)
            return std::nullopt;
        number = number << 8 | value;
        at = part == 3 ? rest : rest + 1;
    }
    return number;
}

std::string addressText(std::uint32_t number) {
    std::string text;
    for (int shift = 24; shift >= 0; shift -= 8)
        text += std::to_string(number >> shift & 0xff) + (shift > 0 ? "." : "");
    return text;
}

bool isSubnetMask(std::uint32_t mask) {
    const std::uint32_t hosts = ~mask;
    return mask != 0 && hosts >= 3 && (hosts & (hosts + 1)) == 0;
}

} // namespace emulator
