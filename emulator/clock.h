#pragma once

#include <chrono>
#include <cstdint>

namespace emulator {

/// Unix milliseconds; the wall clock, because what is kept with a time outlives the process.
inline std::int64_t nowMs() {
    using namespace std::chrono;
    return duration_cast<milliseconds>(system_clock::now().time_since_epoch()).count();
}

} // namespace emulator
