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

/// The service behind the endpoints: its knowledge under one lock, and what lives beside it.
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

    /// Does what has fallen due and, unless life is off, lives a tick when it is time for one.
    void runDueWork();
    /// How long nothing needs to be looked after.
    std::chrono::milliseconds timeUntilNextWork();
    /// Lives one tick, life off or not.
    void step();
    void letLive(bool lives);
    /// To be called once, before the program ends in good order.
    void noteStop();

private:
    bool prepareFleet(const Options &options);
    void prepareAccounts(const Options &options);
    void prepareOrb(const Options &options);

    GenericTokenJudge m_genericTokens;
    std::mutex m_mutex;
    Model m_model;
    std::unique_ptr<FleetSimulator> m_life;
    bool m_lives;
    std::chrono::milliseconds m_tickLength;
    std::chrono::steady_clock::time_point m_nextTick;
};

} // namespace emulator
