#pragma once

#include "accounts.h"
#include "alarm_table.h"
#include "batches.h"
#include "device_authorization.h"
#include "device_table.h"
#include "log_table.h"
#include "orb.h"
#include "scans.h"
#include "sessions.h"
#include "settings.h"
#include "site_tree.h"
#include "store.h"
#include "task_engine.h"

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
