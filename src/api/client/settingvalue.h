#pragma once

#include "platform/json.h"

#include <optional>

/// How values of the service's settings are read wherever they are needed. Services write them in more than
/// one way.
namespace SettingValue {

/// The bounds of the number of firmware uploads that may run at the same time.
inline constexpr int minUploads = 1;
inline constexpr int maxUploads = 50;

/// A switch: a boolean, a number, or one of them as text. Nothing for anything else.
std::optional<bool> toSwitch(const JSON &value);
/// A number, also one that is written as text, without its fraction and brought into the range. Nothing for
/// anything else.
std::optional<int> toNumber(const JSON &value, int min, int max);

/// How many firmware uploads the service lets run at the same time; 0 where it has no limit or does not tell.
int uploadLimit(const JSON &settings);

} // namespace SettingValue
