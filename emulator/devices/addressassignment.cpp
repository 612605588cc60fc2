#include "devices/addressassignment.h"

#include "devices/addressbook.h"
#include "http/response.h"
#include "tables/records.h"
#include "tables/tasktable.h"

#include <unordered_set>

namespace emulator {

namespace {

[[noreturn]] void refuse(const std::string &why) {
    throw Refusal(Code::Malformed, why);
}

std::uint32_t addressMember(const Json &object, const char *name) {
    const auto number = addressNumber(textMember(object, name));
    if (!number)
        refuse(std::string("\"") + name + "\" is no address");
    return *number;
}

void checkNameServers(const Json &body) {
    for (const char *name : {"dns1", "dns2"})
        if (!optionalText(body, name).empty())
            addressMember(body, name);
}

} // namespace

AddressAssignment::AddressAssignment(const Json &body)
    : m_mask(addressMember(body, "mask")), m_gateway(addressMember(body, "gate")) {
    if (!isSubnetMask(m_mask))
        refuse("\"mask\" is no subnet mask");
    if (!Subnet{m_mask, m_gateway}.hasHost(m_gateway))
        refuse("\"gate\" is no address of a host");
    checkNameServers(body);
    readDevices(body);
}

void AddressAssignment::readDevices(const Json &body) {
    std::unordered_set<std::uint32_t> given;
    for (const Json &element : arrayMember(body, "devices")) {
        if (!element.is_object())
            refuse("an element of \"devices\" holds no address");
        const std::string id = filledTextMember(element, "id");
        const std::uint32_t address = addressMember(element, "ip");
        if (!given.insert(address).second || !m_addresses.emplace(id, address).second)
            refuse("an address or a device stands twice in \"devices\"");
        if (!Subnet{m_mask, address}.hasHost(address))
            refuse(addressText(address) + " is the address of a network or of a broadcast");
        m_ids.push_back(id);
    }
}

DeviceWork AddressAssignment::workOf(const Device &device, AddressBook &addresses) const {
    const std::uint32_t address = m_addresses.at(device.id);
    DeviceWork work;
    work.id = device.id;
    work.changes = {{"d_ip", addressText(address)}, {"d_nettype", "static"}};
    const std::string *holder = addresses.holderOf(address);
    // Devices of one assignment may pass their addresses on to each other.
    const bool taken = holder && *holder != device.id && !m_addresses.contains(*holder);
    const bool reaches = Subnet{m_mask, m_gateway}.hasHost(address) && address != m_gateway;
    work.failure = taken || !reaches ? state::mismatch : "";
    return work;
}

DeviceWork automaticAddress(const Device &device, AddressBook &addresses) {
    DeviceWork work;
    work.id = device.id;
    work.changes = {{"d_ip", addresses.lease(device)}, {"d_nettype", "dhcp"}};
    return work;
}

} // namespace emulator
