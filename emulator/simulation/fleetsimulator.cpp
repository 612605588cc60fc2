#include "simulation/fleetsimulator.h"

#include "model.h"
#include "simulation/clock.h"
#include "simulation/devicemaker.h"
#include "simulation/random.h"

#include <array>
#include <utility>

namespace emulator {

namespace {

constexpr auto tickKey = "tick";
// Outages of sixty ticks on the average, three devices of a hundred at a time.
constexpr double dropsPerDevice = 0.03 / 60;
constexpr double actionsPerDevice = 0.005 / 12;
// Every quarter of an hour or so in a fleet of five hundred.
constexpr double troublesPerDevice = 0.000002;
constexpr int maxTries = 8;

std::uint64_t keptTick(Store &store) {
    const std::string text = store.value(tickKey);
    return text.empty() ? 0 : std::stoull(text);
}

} // namespace

FleetSimulator::FleetSimulator(Model &model)
    : m_model(model), m_seed(model.seed()), m_tick(keptTick(model.store)) {
    resume();
}

void FleetSimulator::tick() {
    ++m_tick;
    m_draws = 0;
    Transaction transaction(m_model.store.database());
    takeTurns();
    dropSome();
    keepSomeBusy();
    causeTrouble();
    m_model.store.setValue(tickKey, std::to_string(m_tick));
    transaction.commit();
}

/// Schedules the return of devices that are unreachable at the start.
void FleetSimulator::resume() {
    for (std::size_t i = 0; i < m_model.devices.size(); ++i) {
        const Device &device = m_model.devices.at(i);
        if (!device.reachable && !device.held)
            after(1 + draw(100), {device.id, {}});
    }
}

void FleetSimulator::takeTurns() {
    for (auto due = m_turns.begin(); due != m_turns.end() && due->first <= m_tick; due = m_turns.erase(due)) {
        for (const Turn &turn : due->second) {
            Device *device = m_model.devices.find(turn.device);
            if (!device)
                continue;
            if (!turn.action.empty()) {
                // A command may have given the device something else to do meanwhile.
                device->action = device->action == turn.action ? standby : device->action;
            } else if (!device->held && !device->reachable) {
                device->reachable = true;
                m_model.devices.saveState(*device);
                raise(AlarmKind::ConnectionRestored, *device);
            }
        }
    }
}

void FleetSimulator::dropSome() {
    for (std::uint64_t n = shareOf(dropsPerDevice); n > 0; --n) {
        if (Device *device = pickIdle()) {
            device->reachable = false;
            m_model.devices.saveState(*device);
            raise(AlarmKind::LostConnection, *device);
            after(20 + draw(81), {device->id, {}});
        }
    }
}

void FleetSimulator::keepSomeBusy() {
    static constexpr std::array actions = {"deviceRestart", "deviceRestart", "deviceConfigFileUpload",
                                           "deviceQuickSetup"};
    for (std::uint64_t n = shareOf(actionsPerDevice); n > 0; --n) {
        Device *device = pickIdle();
        if (device && device->authorization == Authorization::Authorized) {
            device->action = actions[draw(actions.size())];
            after(5 + draw(15), {device->id, device->action});
        }
    }
}

void FleetSimulator::causeTrouble() {
    for (std::uint64_t n = shareOf(troublesPerDevice); n > 0; --n) {
        Device *device = pickIdle();
        if (device && device->authorization == Authorization::Authorized) {
            m_model.devices.update(*device,
                                   withMembers(*device, {{"d_sdstatus", "Error"}, {"d_sdusage", 0}}));
            raise(AlarmKind::CardError, *device);
        }
    }
    for (std::uint64_t n = shareOf(troublesPerDevice); n > 0; --n) {
        Device *device = pickIdle();
        if (device && device->authorization == Authorization::Authorized) {
            device->authorization = Authorization::InvalidPassword;
            m_model.devices.saveState(*device);
            raise(AlarmKind::AuthorizationLost, *device);
        }
    }
}

void FleetSimulator::raise(AlarmKind kind, const Device &device) {
    m_model.alarms.raise(kind, &device, nowMs());
}

Device *FleetSimulator::pickIdle() {
    for (int tries = 0; tries < maxTries && m_model.devices.size() != 0; ++tries) {
        Device &device = m_model.devices.at(draw(m_model.devices.size()));
        if (device.reachable && !device.held && device.action == standby)
            return &device;
    }
    return nullptr;
}

/// The whole part of a share always, the rest of it by chance, so that a small fleet lives as well.
std::uint64_t FleetSimulator::shareOf(double perDevice) {
    const double share = perDevice * static_cast<double>(m_model.devices.size());
    const auto whole = static_cast<std::uint64_t>(share);
    constexpr std::uint64_t fine = 1U << 20;
    return whole + (static_cast<double>(draw(fine)) / fine < share - static_cast<double>(whole) ? 1 : 0);
}

void FleetSimulator::after(std::uint64_t ticks, Turn turn) {
    m_turns[m_tick + ticks].push_back(std::move(turn));
}

/// A new generator for each tick, so that its state need not be stored for a restart.
std::uint64_t FleetSimulator::draw(std::uint64_t limit) {
    return mixed(mixed(m_seed ^ 0x11fe) ^ mixed(m_tick) ^ ++m_draws) % limit;
}

} // namespace emulator
