#include "devices/addressbook.h"

#include "model.h"

namespace emulator {

namespace {

constexpr std::uint32_t networkMask = 0xffff0000U;
// The last sixteen thousand addresses of a network or so, without those that end in 0 or 255.
constexpr std::uint32_t firstLeasedNet = 192;
constexpr std::uint32_t leasedNets = 63;
constexpr std::uint32_t hostsPerNet = 254;
constexpr std::uint32_t leases = leasedNets * hostsPerNet;

std::uint32_t leasedAddress(std::uint32_t network, std::uint32_t number) {
    return (network & networkMask) | ((firstLeasedNet + number / hostsPerNet) << 8U) |
           (number % hostsPerNet + 1);
}

bool isLeased(const Device &device, std::uint32_t address) {
    const Json record = Json::parse(device.body);
    const std::uint32_t net = (address >> 8U) & 0xffU;
    return net >= firstLeasedNet && net < firstLeasedNet + leasedNets &&
           record.value("d_nettype", Json()) == "dhcp";
}

} // namespace

const std::string *AddressBook::holderOf(std::uint32_t address) {
    read();
    const auto holder = m_holders.find(address);
    return holder == m_holders.end() ? nullptr : &holder->second;
}

std::string AddressBook::lease(const Device &device) {
    read();
    const auto present = addressNumber(device.ip);
    if (!present || isLeased(device, *present))
        return device.ip;
    // What is passed over once stays taken; a whole fleet asks at a time.
    for (std::uint32_t &next = m_next[*present & networkMask]; next < leases; ++next) {
        const std::uint32_t address = leasedAddress(*present, next);
        if (m_holders.try_emplace(address, device.id).second)
            return addressText(address);
    }
    return device.ip;
}

void AddressBook::read() {
    if (m_isRead)
        return;
    m_isRead = true;
    for (std::size_t i = 0; i < m_model.devices.size(); ++i) {
        const Device &device = m_model.devices.at(i);
        claim(device.ip, device.id);
    }
    readPromises();
}

/// Work that has not ended yet has addresses to give as well.
void AddressBook::readPromises() {
    for (const Task *task : m_model.tasks.open()) {
        for (const TaskDevice &device : task->devices) {
            const auto promised = device.work.changes.find("d_ip");
            const bool stands = device.phase != TaskDevice::Phase::Ended && device.work.failure.empty();
            if (stands && promised != device.work.changes.end())
                claim(promised->get<std::string>(), device.id);
        }
    }
}

void AddressBook::claim(const std::string &address, const std::string &deviceId) {
    if (const auto number = addressNumber(address))
        m_holders.try_emplace(*number, deviceId);
}

} // namespace emulator
