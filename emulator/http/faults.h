#pragma once

#include "simulation/random.h"

#include <cstdint>
#include <mutex>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

namespace emulator {

enum class FaultKind {
    NoResponse,
    Late,
    Reset,
    Status,
    NotJson,
    WrongTypes,
    NoData,
    BadCipher,
    ResponseCode,
    Renew,
    Expire,
    Drip,
    Early,
    CutBody,
    SlowBody,
};

/// One way to answer badly, and when.
struct Fault {
    FaultKind kind = FaultKind::NoResponse;
    int number = 0;    ///< of the kinds that have one
    std::string where; ///< of wrong-types
    std::string path;  ///< beginning of the paths it is for
    std::uint64_t after = 0;
    std::optional<std::uint64_t> times;
    double rate = 1;

    std::uint64_t seen = 0;
    std::uint64_t hits = 0;
};

class FaultError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Reads KIND[=VALUE][@PATH][,after=N][,times=N][,rate=P]; throws FaultError saying what is wrong.
Fault readFault(const std::string &text);

/// What befalls one request. Delays, slow bodies, renewals and expiries add up; of the other kinds the first
/// wins.
struct FaultPlan {
    int lateMs = 0;
    int bodyRate = 0; ///< KiB a second; 0 for no bound
    bool renew = false;
    bool expire = false;
    std::optional<Fault> main;
};

/// The faults that are in force; may be used from any thread.
class Faults {
public:
    explicit Faults(std::uint64_t seed) : m_random(seed) {}

    void add(const std::string &text);
    void clear();
    FaultPlan planFor(const std::string &path);

private:
    bool hits(Fault &fault, const std::string &path);

    std::mutex m_mutex;
    std::vector<Fault> m_faults;
    Random m_random;
};

} // namespace emulator
