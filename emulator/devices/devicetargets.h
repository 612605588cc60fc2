#pragma once

#include "http/jsonaccess.h"

#include <string>
#include <vector>

namespace emulator {

struct Model;

/// A device that a request names, and the task under which the work on it runs; empty for none.
struct Target {
    std::string id;
    std::string taskId;
};

/// The elements of an argument that names devices: ids or objects with "id" and, perhaps, "tid".
std::vector<Target> targetsOf(const Json &body, const char *name = "devices");
std::vector<std::string> idsOf(const std::vector<Target> &targets);
/// Throws Refusal(UnknownId) when one is no managed device.
void checkKnown(const Model &model, const std::vector<Target> &targets);

} // namespace emulator
