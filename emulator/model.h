#pragma once

#include "devices/deviceauthorization.h"
#include "devices/scans.h"
#include "http/sessions.h"
#include "tables/accounts.h"
#include "tables/alarmtable.h"
#include "tables/batches.h"
#include "tables/devicetable.h"
#include "tables/logtable.h"
#include "tables/orb.h"
#include "tables/settings.h"
#include "tables/sitetree.h"
#include "tables/store.h"
#include "tasks/taskengine.h"

#include <filesystem>

namespace emulator {

struct ModelLimits {
    SessionLimits sessions;
    std::int64_t batchTimeoutMs = 60000;
    std::int64_t blockMs = 60000;
    std::int64_t orbSignInMs = 600000;
};

/// Everything that the service knows. Not thread-safe: the service hands it out under its lock.
struct Model {
    Model(const std::filesystem::path &storePath, const ModelLimits &limits);

    /// True when the store has a fleet already.
    bool hasFleet();
    /// What the fleet was made with, and how many devices were ever made from it.
    std::uint64_t seed();
    std::uint64_t devicesMade();
    void fleetWasMade(std::uint64_t fleetSeed, std::uint64_t made);

    Store store;
    Accounts accounts;
    Sessions sessions;
    Settings settings;
    SiteTree sites;
    DeviceTable devices;
    DeviceAuthorization authorization;
    Scans scans;
    Batches batches;
    LogTable log;
    AlarmTable alarms;
    TaskTable tasks;
    TaskEngine engine;
    Orb orb;
};

/// Drops sites from the tree and from the devices in one step.
void commitSites(Model &model, const Json &records);
void removeSite(Model &model, const std::string &id);

} // namespace emulator
