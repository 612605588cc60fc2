#pragma once

#include <cstdint>
#include <string>
#include <unordered_map>

namespace emulator {

class DeviceTable;
struct Device;

/// The devices that are away because they restart. None of it is written down: a device comes back from a
/// restart, whatever becomes of this program.
class DeviceOutages {
public:
    explicit DeviceOutages(DeviceTable &devices) : m_devices(devices) {}

    bool has(const std::string &deviceId) const { return m_outages.contains(deviceId); }

    /// Takes a device away until a time; the action, if there is one, ends with that.
    void begin(Device &device, const std::string &action, std::int64_t endsAt);

    /// Brings one device back, or all of them, whose time has come.
    void endOf(const std::string &deviceId, std::int64_t nowMs);
    void endDue(std::int64_t nowMs);

private:
    struct Outage {
        std::int64_t endsAt = 0;
        std::string action;
    };

    void end(const std::string &deviceId, const Outage &outage);

    DeviceTable &m_devices;
    std::unordered_map<std::string, Outage> m_outages;
};

} // namespace emulator
