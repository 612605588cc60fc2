#pragma once

#include <cstddef>
#include <cstdint>

namespace emulator {

struct Model;

struct FleetPlan {
    std::size_t devices = 500;
    std::size_t sites = 12;
    std::uint64_t seed = 1;
    bool malformedDevices = false;
};

/// Fills an empty model with sites and devices and keeps them in its store.
void makeFleet(Model &model, const FleetPlan &plan);

/// Adds devices to a fleet that is there, each in the overview only.
void addDevices(Model &model, std::size_t count);

} // namespace emulator
