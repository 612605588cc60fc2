#pragma once

#include <cstdint>
#include <filesystem>
#include <stdexcept>
#include <string>
#include <vector>

namespace emulator {

/// An account that the command line asks for.
struct StartAccount {
    std::string email;
    std::string password;
    std::string permission;
};

/// A user of the remote-access service.
struct OrbUser {
    std::string email;
    std::string password;
    bool expired = false;
};

/// What the command line says.
struct Options {
    std::string host = "127.0.0.1";
    int port = 0;
    std::size_t devices = 500;
    std::size_t sites = 12;
    std::uint64_t seed = 1;
    std::filesystem::path root;
    int latencyMs = 0;
    std::uint64_t uploadLimit = 8ULL << 30;
    int lifeMs = 1000;
    std::size_t sessionLimit = 0;
    std::int64_t batchTimeoutMs = 60000;
    std::int64_t tokenGraceMs = 60000;
    std::int64_t blockMs = 60000;
    std::int64_t taskPaceMs = 1000;
    std::int64_t taskWorkTimeoutMs = 120000;
    double taskFailures = 0;
    std::size_t tasks = 0;
    std::size_t taskDevices = 20;
    std::size_t alarms = 0;
    std::size_t logEntries = 0;
    std::vector<std::string> faults;
    std::vector<StartAccount> accounts;
    std::vector<OrbUser> orbUsers;
    std::int64_t orbSignInMs = 600000;
    bool fresh = false;
    bool newKey = false;
    bool malformedDevices = false;
    bool help = false;
    bool version = false;
};

class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Throws UsageError for anything that is not understood.
Options readOptions(const std::vector<std::string> &arguments);

std::string helpText();

} // namespace emulator
