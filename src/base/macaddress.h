#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

/// MAC addresses as texts, whose digits may have colons, dashes, dots or blanks between them.
namespace MacAddress {

/// The hex digits of a text in upper case, without what separates them; empty for a text with any other
/// character. A part of an address has fewer of them.
std::string digits(std::string_view text);

/// The twelve digits of a whole address: equal for equal addresses. Empty for any other text.
std::string plain(std::string_view text);

/// The same as a number; nothing for any other text.
std::optional<std::uint64_t> parse(std::string_view text);

} // namespace MacAddress
