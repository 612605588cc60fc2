#pragma once

#include <chrono>
#include <cstdint>
#include <ctime>

namespace emulator {

/// Unix milliseconds; the wall clock, because what is kept with a time outlives the process.
inline std::int64_t nowMs() {
    using namespace std::chrono;
    return duration_cast<milliseconds>(system_clock::now().time_since_epoch()).count();
}

/// Date and time of day in UTC; the fields that no caller reads stay 0.
inline std::tm utcParts(std::int64_t timeMs) {
    using namespace std::chrono;
    const auto time = sys_time<milliseconds>(milliseconds(timeMs));
    const auto midnight = floor<days>(time);
    const year_month_day date(midnight);
    const hh_mm_ss clock(floor<seconds>(time - midnight));
    std::tm parts{};
    parts.tm_year = static_cast<int>(date.year()) - 1900;
    parts.tm_mon = static_cast<int>(static_cast<unsigned>(date.month())) - 1;
    parts.tm_mday = static_cast<int>(static_cast<unsigned>(date.day()));
    parts.tm_hour = static_cast<int>(clock.hours().count());
    parts.tm_min = static_cast<int>(clock.minutes().count());
    parts.tm_sec = static_cast<int>(clock.seconds().count());
    return parts;
}

inline std::int64_t msOfUtc(const std::tm &parts) {
    using namespace std::chrono;
    const year_month_day date(year(parts.tm_year + 1900), month(static_cast<unsigned>(parts.tm_mon) + 1),
                              day(static_cast<unsigned>(parts.tm_mday)));
    const auto time = sys_days(date) + hours(parts.tm_hour) + minutes(parts.tm_min) + seconds(parts.tm_sec);
    return duration_cast<milliseconds>(time.time_since_epoch()).count();
}

} // namespace emulator
