#pragma once

#include "http/generictoken.h"
#include "model.h"
#include "simulation/fleetsimulator.h"

#include <chrono>
#include <filesystem>
#include <mutex>
#include <string>
#include <utility>
#include <vector>

namespace emulator {

struct Options;

/// The service behind the endpoints: its model under one lock, and the simulation of the fleet.
class Service {
public:
    /// Opens the store in the folder, makes the fleet where there is none and says so on standard error.
    Service(const Options &options, const std::filesystem::path &storePath);

    /// Runs work on the model, alone. Nothing slow belongs in there: every request waits for it.
    template <typename Work>
    auto withModel(Work work) {
        const std::lock_guard lock(m_mutex);
        return work(m_model);
    }

    const GenericTokenJudge &genericTokens() const { return m_genericTokens; }

    /// Does the work that is due and, unless the simulation is off, a tick of it when its time has come.
    void runDueWork();
    /// The time until runDueWork must be called again.
    std::chrono::milliseconds timeUntilNextWork();
    /// Simulates one tick, also while the simulation is off.
    void step();
    void setSimulating(bool on);
    /// To be called once, before the program ends normally.
    void noteStop();

private:
    bool prepareFleet(const Options &options);
    void prepareAccounts(const Options &options);
    void prepareOrb(const Options &options);

    GenericTokenJudge m_genericTokens;
    std::mutex m_mutex;
    Model m_model;
    std::unique_ptr<FleetSimulator> m_simulator;
    bool m_simulating;
    std::chrono::milliseconds m_tickLength;
    std::chrono::steady_clock::time_point m_nextTick;
};

} // namespace emulator
