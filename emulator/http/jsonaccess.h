#pragma once

#include <nlohmann/json.hpp>

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace emulator {

using Json = nlohmann::json;

/// Parses a text; throws Refusal(Malformed) for anything that is no JSON or nests too deeply to be handled.
Json parseJson(std::string_view text);

/// The text of a value; broken UTF-8 is replaced, never thrown over.
std::string jsonText(const Json &value);

/// The members of an object; all throw Refusal(Malformed) for a member that is missing or of another type.
const Json &member(const Json &object, const char *name);
std::string textMember(const Json &object, const char *name);
std::string filledTextMember(const Json &object, const char *name);
std::int64_t integerMember(const Json &object, const char *name);
const Json &arrayMember(const Json &object, const char *name);
std::vector<std::string> textsMember(const Json &object, const char *name);

/// Empty where the member is missing or null; throws for another type.
std::string optionalText(const Json &object, const char *name);

/// A part of a list, as "start" and "count" ask for it; the count is held within the service's limit.
struct Page {
    std::size_t start = 0;
    std::size_t count = 0;
};
Page pageOf(const Json &body);

} // namespace emulator
