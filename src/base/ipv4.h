#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

/// IPv4 addresses as texts and as numbers, the first part highest.
namespace Ipv4 {

/// The number of four parts from 0 to 255 with dots between them, each of one to three decimal digits;
/// nothing for any other text. Leading zeros are passed over: "010.0.0.9" is 10.0.0.9.
std::optional<std::uint32_t> parse(std::string_view text);

/// Without leading zeros.
std::string toText(std::uint32_t address);

/// Whether a number is a mask: its ones stand before its zeros, with some of both.
bool isMask(std::uint32_t address);

} // namespace Ipv4
