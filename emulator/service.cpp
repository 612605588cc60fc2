#include "service.h"

#include "options.h"
#include "simulation/clock.h"
#include "simulation/fleet.h"
#include "simulation/history.h"

#include <algorithm>
#include <iostream>

namespace emulator {

namespace {

ModelLimits limitsOf(const Options &options) {
    return {{options.sessionLimit, options.tokenGraceMs},
            options.batchTimeoutMs,
            options.blockMs,
            options.orbSignInMs};
}

using Clock = std::chrono::steady_clock;

} // namespace

Service::Service(const Options &options, const std::filesystem::path &storePath)
    : m_genericTokens(options.root),
      m_model(storePath, limitsOf(options)),
      m_simulating(options.lifeMs > 0),
      m_tickLength(options.lifeMs > 0 ? options.lifeMs : 1000),
      m_nextTick(Clock::now() + m_tickLength) {
    const bool isNew = prepareFleet(options);
    prepareAccounts(options);
    prepareOrb(options);
    if (isNew)
        makeHistory(m_model, {options.tasks, options.taskDevices, options.alarms, options.logEntries});
    m_model.engine.rules() = {options.taskPaceMs, options.taskWorkTimeoutMs, options.taskFailures,
                              m_model.seed()};
    m_model.alarms.raise(AlarmKind::ServerStarted, nullptr, nowMs());
    m_model.scans.seedNeighbours(m_model.seed());
    m_simulator = std::make_unique<FleetSimulator>(m_model);
}

void Service::runDueWork() {
    const std::lock_guard lock(m_mutex);
    m_model.authorization.settle(nowMs());
    m_model.batches.dropOverdue(nowMs());
    m_model.engine.settle(nowMs());
    m_model.log.expire(nowMs(), m_model.settings.logDays());
    if (Clock::now() < m_nextTick)
        return;
    // A tick that comes late is not made up for.
    m_nextTick = std::max(m_nextTick + m_tickLength, Clock::now());
    if (m_simulating)
        m_simulator->tick();
}

std::chrono::milliseconds Service::timeUntilNextWork() {
    using std::chrono::milliseconds;
    const std::lock_guard lock(m_mutex);
    const milliseconds pace(m_model.engine.rules().paceMs);
    const milliseconds untilTick = std::chrono::ceil<milliseconds>(m_nextTick - Clock::now());
    return std::clamp(std::min(pace, untilTick), milliseconds(10), milliseconds(1000));
}

void Service::step() {
    const std::lock_guard lock(m_mutex);
    m_simulator->tick();
}

void Service::setSimulating(bool on) {
    const std::lock_guard lock(m_mutex);
    m_simulating = on;
}

void Service::noteStop() {
    const std::lock_guard lock(m_mutex);
    m_model.alarms.raise(AlarmKind::ServerStopped, nullptr, nowMs());
}

bool Service::prepareFleet(const Options &options) {
    if (m_model.hasFleet()) {
        std::cerr << "nvldm-emulator: keeps the " << m_model.devices.size()
                  << " devices of its store; --devices, --sites and --seed are not used\n";
        return false;
    }
    makeFleet(m_model, {options.devices, options.sites, options.seed, options.malformedDevices});
    return true;
}

void Service::prepareAccounts(const Options &options) {
    if (m_model.accounts.all().empty())
        m_model.accounts.addFactoryAccount(hashPassword("admin"));
    for (const StartAccount &wanted : options.accounts) {
        if (!m_model.accounts.find(wanted.email)) {
            m_model.accounts.add(
                {wanted.email, wanted.email, wanted.permission, {}, hashPassword(wanted.password)});
        }
    }
}

void Service::prepareOrb(const Options &options) {
    for (const OrbUser &user : options.orbUsers)
        m_model.orb.setUser(user.email, {hashPassword(user.password), user.expired});
    if (!m_model.orb.hasUsers()) {
        const PasswordHash password = hashPassword("Partner-1");
        m_model.orb.setUser("partner@norvell.example", {password, false});
        m_model.orb.setUser("expired@norvell.example", {password, true});
    }
}

} // namespace emulator
