#pragma once

#include "http/jsonaccess.h"

#include <cstdint>
#include <string>
#include <unordered_map>

namespace emulator {

class DeviceTable;
struct Device;

/// Who may order a work from a device: which authorization the device must have.
enum class Access {
    Anyone,
    Authorized,
    FirstOwner, ///< the service, or any caller while the device waits for its first password
};

/// What one device does for a request.
struct DeviceWork {
    std::string id;
    Json changes = Json::object(); ///< members of its record when the work succeeds; null takes one out
    bool restarts = false;         ///< it is away for a moment while it works
    std::string failure;           ///< a code in which the work is bound to end; empty for none
    Access access = Access::Authorized;
    std::string secret;          ///< what is kept of the account's new password; empty for no new one
    bool forgetsAccount = false; ///< it waits for a first password again
};

/// The work as it is kept in the store, and back.
Json toJson(const DeviceWork &work);
DeviceWork deviceWorkOf(const Json &kept);

/// True when the device does a work of this access.
bool isPermitted(const Device &device, Access access);

/// Applies the effects of a work that has succeeded to its device.
void apply(DeviceTable &devices, Device &device, const DeviceWork &work);

/// The devices that are away because they restart. None of it is written down: a device comes back from a
/// restart also when this program ends.
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
