#pragma once

#include <charconv>
#include <chrono>
#include <cstdint>
#include <string_view>

/// Writes numbers and moments piece by piece to a function, without a heap: for the text of a dying process.
class CrashText {
public:
    using Put = void (*)(std::string_view);

    explicit CrashText(Put put) : m_put(put) {}

    CrashText &operator<<(std::string_view text) {
        m_put(text);
        return *this;
    }
    CrashText &decimal(long long value) { return number(value, 10); }
    CrashText &hexadecimal(std::uintptr_t value) {
        *this << "0x";
        return number(value, 16);
    }
    /// In UTC: the zone's rules stand in files.
    CrashText &moment(std::int64_t secondsSinceEpoch) {
        using namespace std::chrono;
        const sys_seconds time{seconds(secondsSinceEpoch)};
        const year_month_day day{floor<days>(time)};
        const hh_mm_ss clock{time - floor<days>(time)};
        decimal(int{day.year()}) << "-";
        twoDigits(unsigned{day.month()}) << "-";
        twoDigits(unsigned{day.day()}) << " ";
        twoDigits(clock.hours().count()) << ":";
        twoDigits(clock.minutes().count()) << ":";
        return twoDigits(clock.seconds().count()) << " UTC";
    }

private:
    template <typename Number>
    CrashText &number(Number value, int base) {
        char digits[24];
        const auto end = std::to_chars(digits, digits + sizeof digits, value, base).ptr;
        return *this << std::string_view(digits, static_cast<std::size_t>(end - digits));
    }
    CrashText &twoDigits(long long value) {
        if (value < 10)
            *this << "0";
        return decimal(value);
    }

    Put m_put;
};
