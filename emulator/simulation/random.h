#pragma once

#include <cstdint>

namespace emulator {

/// Scatters a number over 64 bits, the same on every machine.
constexpr std::uint64_t mixed(std::uint64_t value) {
    value += 0x9e3779b97f4a7c15ULL;
    value = (value ^ (value >> 30)) * 0xbf58476d1ce4e5b9ULL;
    value = (value ^ (value >> 27)) * 0x94d049bb133111ebULL;
    return value ^ (value >> 31);
}

/// A repeatable generator; the distributions of the standard library differ between implementations.
class Random {
public:
    explicit Random(std::uint64_t seed) : m_state(seed) {}

    std::uint64_t next() {
        m_state += 0x9e3779b97f4a7c15ULL;
        return mixed(m_state);
    }

    /// 0 to limit - 1; limit must not be 0.
    std::uint64_t below(std::uint64_t limit) { return next() % limit; }

    bool chance(double probability) { return static_cast<double>(next() >> 11) * 0x1.0p-53 < probability; }

private:
    std::uint64_t m_state;
};

} // namespace emulator
