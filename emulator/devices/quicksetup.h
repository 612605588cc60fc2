#pragma once

#include "http/jsonaccess.h"

#include <cstdint>

namespace emulator {

/// The members of a device's record that settings of the quick setup change. Throws Refusal(Malformed) for a
/// setting that makes no sense and where there is none at all.
Json quickSetupChanges(const Json &settings, std::int64_t nowMs);

/// Minutes by which the clock of a POSIX time zone is ahead of UTC, without daylight saving; throws
/// Refusal(Malformed) for a text that is no such zone.
int minutesAhead(const std::string &posixZone);

} // namespace emulator
