#pragma once

#include <nlohmann/json_fwd.hpp>

#include <QString>

#include <string>
#include <string_view>

/// The JSON value of every request, answer and record.
using JSON = nlohmann::json;

/// Parses text from outside. Throws the JSON library's exception for text that is not JSON, and
/// std::length_error for more than 64 levels, with which later copies and dumps would overflow the stack, and
/// for more than five million values.
JSON parseJson(std::string_view text);

/// Serialises; bytes that are not UTF-8 are replaced instead of throwing.
std::string dumpJson(const JSON &value);

/// The text of a member; empty where the value is no object, or the member is missing or of another type. The
/// view lives as long as the value.
std::string_view textMember(const JSON &object, const char *name);
/// The same as a QString.
QString stringMember(const JSON &object, const char *name);
