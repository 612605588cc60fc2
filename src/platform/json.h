#pragma once

#include <nlohmann/json_fwd.hpp>

#include <string>
#include <string_view>

/// The JSON value of every request, answer and record.
using JSON = nlohmann::json;

/// Parses text from outside. Throws the JSON library's exception for text that is not JSON, and for values
/// nested deeper than 64 levels, which later copies and dumps would overflow the stack with.
JSON parseJson(std::string_view text);

/// Serialises; bytes that are not UTF-8 are replaced instead of throwing.
std::string dumpJson(const JSON &value);
