#pragma once

#include <cstdint>
#include <optional>
#include <string>

namespace emulator {

/// The number of an IPv4 text and back; nothing for a text that is none.
std::optional<std::uint32_t> addressNumber(const std::string &text);
std::string addressText(std::uint32_t number);

/// A subnet by its mask and one of its addresses.
struct Subnet {
    std::uint32_t mask = 0;
    std::uint32_t member = 0;

    bool contains(std::uint32_t address) const { return (address & mask) == (member & mask); }
    /// True for an address that a host may have: neither the network's nor that of a broadcast.
    bool hasHost(std::uint32_t address) const {
        return contains(address) && (address & ~mask) != 0 && (address | mask) != UINT32_MAX;
    }
};

/// True for a mask that leaves room for two hosts at least.
bool isSubnetMask(std::uint32_t mask);

} // namespace emulator
