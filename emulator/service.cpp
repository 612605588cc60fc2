#include "service.h"

#include "clock.h"
#include "fleet.h"
#include "options.h"

#include <iostream>

namespace emulator {

namespace {

ModelLimits limitsOf(const Options &options) {
    return {{options.sessionLimit, options.tokenGraceMs}, options.batchTimeoutMs};
}

} // namespace

Service::Service(const Options &options, const std::filesystem::path &storePath)
    : m_genericTokens(options.root), m_model(storePath, limitsOf(options)) {
    prepareFleet(options);
    prepareAccounts(options);
    m_model.scans.seedNeighbours(m_model.seed());
    m_life = std::make_unique<Life>(m_model);
}

void Service::lookAfter() {
    const std::lock_guard lock(m_mutex);
    m_model.authorization.settle(nowMs());
    m_model.batches.dropOverdue(nowMs());
    if (m_lives) {
        m_life->tick();
    }
}

void Service::liveTick() {
    const std::lock_guard lock(m_mutex);
    m_life->tick();
}

void Service::letLive(bool lives) {
    const std::lock_guard lock(m_mutex);
    m_lives = lives;
}

void Service::prepareFleet(const Options &options) {
    if (m_model.hasFleet()) {
        std::cerr << "nvldm-emulator: keeps the " << m_model.devices.size()
                  << " devices of its store; --devices, --sites and --seed are not used\n";
        return;
    }
    makeFleet(m_model, {options.devices, options.sites, options.seed, options.oddRecords});
}

void Service::prepareAccounts(const Options &options) {
    if (m_model.accounts.all().empty()) {
        m_model.accounts.addFactoryAccount(hashPassword("admin"));
    }
    for (const StartAccount &wanted : options.accounts) {
        if (!m_model.accounts.find(wanted.email)) {
            m_model.accounts.add(
                {wanted.email, wanted.email, wanted.permission, {}, hashPassword(wanted.password)});
        }
    }
}

} // namespace emulator
