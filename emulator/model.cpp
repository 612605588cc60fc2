#include "model.h"

namespace emulator {

namespace {

constexpr auto seedKey = "seed";
constexpr auto madeKey = "devices_made";

std::uint64_t numberOf(const std::string &text) {
    return text.empty() ? 0 : std::stoull(text);
}

} // namespace

Model::Model(const std::filesystem::path &storePath, const ModelLimits &limits)
    : store(storePath),
      accounts(store),
      sessions(store, limits.sessions),
      settings(store),
      sites(store),
      devices(store),
      authorization(devices, store, limits.blockMs),
      scans(devices),
      batches(limits.batchTimeoutMs),
      log(store),
      alarms(store, log),
      tasks(store),
      engine(store, tasks, devices, settings, log),
      orb(store, limits.orbSignInMs) {}

bool Model::hasFleet() {
    return !store.value(seedKey).empty();
}

std::uint64_t Model::seed() {
    return numberOf(store.value(seedKey));
}

std::uint64_t Model::devicesMade() {
    return numberOf(store.value(madeKey));
}

void Model::fleetWasMade(std::uint64_t fleetSeed, std::uint64_t made) {
    store.setValue(seedKey, std::to_string(fleetSeed));
    store.setValue(madeKey, std::to_string(made));
}

void commitSites(Model &model, const Json &records) {
    Transaction transaction(model.store.database());
    model.devices.leaveSites(model.sites.commit(records));
    transaction.commit();
}

void removeSite(Model &model, const std::string &id) {
    Transaction transaction(model.store.database());
    model.devices.leaveSites(model.sites.remove(id));
    transaction.commit();
}

} // namespace emulator
