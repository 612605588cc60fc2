#pragma once

#include "tables/alarmtable.h"
#include "tables/records.h"

#include <cstdint>
#include <map>
#include <string>
#include <vector>

namespace emulator {

struct Model;

/// Lets devices drop out and come back, get busy and idle again. The same seed and the same fleet live the
/// same life, tick by tick.
class FleetSimulator {
public:
    explicit FleetSimulator(Model &model);

    /// Lives one tick; the model must be locked.
    void tick();

private:
    struct Turn {
        std::string device;
        std::string action; ///< the action that ends; empty for a device that comes back
    };

    void resume();
    void takeTurns();
    void dropSome();
    void keepSomeBusy();
    void causeTrouble();
    void raise(AlarmKind kind, const Device &device);
    Device *pickIdle();
    std::uint64_t shareOf(double perDevice);
    void after(std::uint64_t ticks, Turn turn);
    std::uint64_t draw(std::uint64_t limit);

    Model &m_model;
    std::uint64_t m_seed;
    std::uint64_t m_tick;
    std::uint64_t m_draws = 0;
    std::map<std::uint64_t, std::vector<Turn>> m_turns;
};

} // namespace emulator
