#pragma once

#include <string>
#include <vector>

namespace emulator {

class Random;

/// The types of tasks that the service has.
const std::vector<std::string> &taskTypes();

/// One of the codes in which work on a device fails.
std::string failureCode(Random &random);

} // namespace emulator
