#pragma once

#include "http/jsonaccess.h"

#include <string>
#include <vector>

namespace emulator {

struct Model;

/// Adds, changes and removes devices as the records say, all of them or, with a Refusal, none.
void commitDevices(Model &model, const Json &records);

/// Removes devices from the service; they can be found by a scan from then on.
void removeDevices(Model &model, const std::vector<std::string> &ids);

} // namespace emulator
