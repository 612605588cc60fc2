#pragma once

#include "simulation/ipv4.h"

#include <cstdint>
#include <string>
#include <unordered_map>

namespace emulator {

struct Device;
struct Model;

/// Who has which address on the fleet's network, and who is about to get one. It is read from the model when
/// it is first asked, and holds for one request.
class AddressBook {
public:
    explicit AddressBook(const Model &model) : m_model(model) {}

    /// The id of the device that has the address or is promised it; null where it is free.
    const std::string *holderOf(std::uint32_t address);

    /// The address that the network's DHCP server gives the device: one from the end of its own /16 network,
    /// or the one that it has when it came from there or none is free.
    std::string lease(const Device &device);

private:
    void read();
    void readPromises();
    void claim(const std::string &address, const std::string &deviceId);

    const Model &m_model;
    bool m_isRead = false;
    std::unordered_map<std::uint32_t, std::string> m_holders;
    std::unordered_map<std::uint32_t, std::uint32_t> m_next; ///< the lease to try next, by network
};

} // namespace emulator
