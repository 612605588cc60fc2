#pragma once

#include "devices/devicework.h"
#include "http/jsonaccess.h"

#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

namespace emulator {

class AddressBook;
struct Device;

/// Addresses given by hand, one to each device.
class AddressAssignment {
public:
    /// Throws Refusal(Malformed) for texts that are no addresses, for a mask that is none, for a gateway that
    /// no device could use, and for an address that is given twice.
    explicit AddressAssignment(const Json &body);

    const std::vector<std::string> &deviceIds() const { return m_ids; }

    /// A device whose address another device has, or that could not reach the gateway from there, fails.
    DeviceWork workOf(const Device &device, AddressBook &addresses) const;

private:
    void readDevices(const Json &body);

    std::uint32_t m_mask = 0;
    std::uint32_t m_gateway = 0;
    std::vector<std::string> m_ids;
    std::unordered_map<std::string, std::uint32_t> m_addresses; ///< by the id of their device
};

/// The work of a device that asks the network for an address.
DeviceWork automaticAddress(const Device &device, AddressBook &addresses);

} // namespace emulator
