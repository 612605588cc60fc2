#pragma once

#include "http/jsonaccess.h"

#include <string>

namespace emulator {

class DeviceTable;
struct Device;

/// Whom a device must have let in before it does a work.
enum class Access {
    Anybody,
    Authorized,
    FirstOwner, ///< the service, or whoever comes first while the device waits for its first password
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

/// Lets the effects of a work that has succeeded show on its device.
void apply(DeviceTable &devices, Device &device, const DeviceWork &work);

} // namespace emulator
