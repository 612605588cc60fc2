#pragma once

#include "http/jsonaccess.h"

#include <string>

namespace emulator {

struct Device;

/// The configuration that a device reports: the sections System, Media, Network, Storage and Custom,
/// each with its items.
Json configurationOf(const Device &device);

/// The members of a device's record that a template changes: a YAML text with the same sections and items.
/// Items that cannot be set, or that devices do not know, are passed over. Throws Refusal(Malformed) for a
/// text that is no such template and for a value that its item cannot have.
Json templateChanges(const std::string &yaml);

} // namespace emulator
