#pragma once

#include "http/jsonaccess.h"

#include <string>

namespace emulator {

/// What the log says about a request that was granted; empty for one that changes nothing, and for those
/// whose endpoint writes the log itself.
std::string auditText(const std::string &path, const Json &body);

} // namespace emulator
