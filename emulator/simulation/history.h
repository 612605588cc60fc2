#pragma once

#include <cstddef>

namespace emulator {

struct Model;

struct HistoryPlan {
    std::size_t tasks = 0;
    std::size_t taskDevices = 20;
    std::size_t alarms = 0;
    std::size_t logEntries = 0;
};

/// Gives a new fleet a past of some days.
void makeHistory(Model &model, const HistoryPlan &plan);

} // namespace emulator
