#pragma once

#include "http/jsonaccess.h"
#include "tables/records.h"

#include <cstdint>
#include <deque>
#include <string>
#include <vector>

namespace emulator {

class DeviceTable;

/// Looks for devices on the network: some that are not managed yet, those that were removed, and managed
/// ones.
class Scans {
public:
    explicit Scans(const DeviceTable &devices) : m_devices(devices) {}

    /// Puts unmanaged devices on the network.
    void seedNeighbours(std::uint64_t seed);

    /// Each start forgets what the scan before it found. The addresses are IPv4 texts.
    void start(std::int64_t nowMs);
    void startAddress(const std::string &address, std::int64_t nowMs);
    void startRange(const std::string &first, const std::string &last, std::int64_t nowMs);

    /// What the scan has found by now, as a JSON array.
    std::string foundText(std::int64_t nowMs) const;

    /// A device that is managed no longer stays on the network.
    void release(const Device &device);

private:
    struct Neighbour {
        std::string macKey;
        std::uint32_t address = 0;
        Json record;
    };
    struct Found {
        std::int64_t at = 0;
        std::string record;
    };
    struct Target {
        std::uint32_t first = 0;
        std::uint32_t last = 0;
        std::int64_t port = 0; ///< 0 for any
    };

    void search(const Target &target, std::size_t maxManaged, std::int64_t nowMs);

    const DeviceTable &m_devices;
    std::deque<Neighbour> m_neighbours;
    std::vector<Found> m_found;
};

} // namespace emulator
