#pragma once

#include <optional>
#include <string>
#include <string_view>

/// nvlcrypto's operations as values; nothing where an operation fails.
namespace Ciphers {

std::optional<std::string> sealSecret(std::string_view secret);
std::optional<std::string> openSecret(std::string_view cipher);
std::optional<std::string> openData(std::string_view cypher);
std::optional<std::string> genericToken();

} // namespace Ciphers
