#include "ipv4.h"

#include <arpa/inet.h>

#include <array>

namespace emulator {

std::optional<std::uint32_t> addressNumber(const std::string &text) {
    in_addr address{};
    if (inet_pton(AF_INET, text.c_str(), &address) != 1) {
        return std::nullopt;
    }
    return ntohl(address.s_addr);
}

std::string addressText(std::uint32_t number) {
    const in_addr address{htonl(number)};
    std::array<char, INET_ADDRSTRLEN> text{};
    return inet_ntop(AF_INET, &address, text.data(), text.size());
}

bool isSubnetMask(std::uint32_t mask) {
    const std::uint32_t hosts = ~mask;
    return mask != 0 && hosts >= 3 && (hosts & (hosts + 1)) == 0;
}

} // namespace emulator
