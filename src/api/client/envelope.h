#pragma once

#include "platform/json.h"

#include <nlohmann/json.hpp>

#include <optional>
#include <string_view>

/// An answer of the service. The text of its member "data", which may be megabytes, stays where it is: the
/// JSON parser reads such a text letter by letter and copies it.
struct Envelope {
    JSON members; ///< all of them, but the text of "data" is empty where it was left out
    /// The text of "data": a view into the answer. Nothing where "data" is missing, no text, or one with
    /// anything but plain letters.
    std::optional<std::string_view> data;

    /// Throws what parseJson throws.
    static Envelope open(std::string_view answer);
};
