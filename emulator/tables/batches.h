#pragma once

#include "http/jsonaccess.h"

#include <map>
#include <optional>
#include <string>

namespace emulator {

/// The commits that come in stages, one open batch for each session and family.
class Batches {
public:
    explicit Batches(std::int64_t timeoutMs) : m_timeoutMs(timeoutMs) {}

    /// Takes a stage ("all", "start", "update", "end") and gives the records once they are complete. Throws
    /// Refusal(Malformed) for an unknown stage and for one that continues no open batch.
    std::optional<Json> take(const std::string &owner, const std::string &stage, Json records,
                             std::int64_t nowMs);

    void dropOverdue(std::int64_t nowMs);

private:
    struct Batch {
        std::int64_t openedAt = 0;
        Json records;
    };

    std::int64_t m_timeoutMs;
    std::map<std::string, Batch> m_open;
};

} // namespace emulator
