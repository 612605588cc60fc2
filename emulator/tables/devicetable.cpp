#include "tables/devicetable.h"

#include "http/response.h"
#include "simulation/random.h"
#include "tables/store.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <utility>

namespace emulator {

namespace {

constexpr auto counterKey = "device_ids";
constexpr std::array<std::string_view, 6> authorizationNames = {
    "Unauthorized", "Authorized", "Access Denied", "Invalid Password", "Account Blocked", "Set Password"};

std::string sitesText(const Device &device) {
    const std::string list = jsonText(device.sites);
    return device.sitesAsText ? jsonText(list) : list;
}

void appendStatus(std::string &text, const Device &device) {
    text += R"({"id":")";
    text += device.id;
    text += device.reachable ? R"(","connect_status":"Connected","auth_status":")"
                             : R"(","connect_status":"Unreachable","auth_status":")";
    text += nameOf(device.authorization);
    text += R"(","action_status":)" + jsonText(device.action) + '}';
}

} // namespace

DeviceTable::DeviceTable(Store &store) : m_store(store) {
    store.loadDevices([this](Device device) {
        m_devices.push_back(std::make_unique<Device>(std::move(device)));
        index(*m_devices.back());
    });
    const std::string counter = store.value(counterKey);
    m_idCounter = counter.empty() ? 0 : std::stoull(counter);
}

Device *DeviceTable::find(const std::string &id) const {
    const auto found = m_byId.find(id);
    return found == m_byId.end() ? nullptr : found->second;
}

Device *DeviceTable::findByMac(const std::string &macKey) const {
    const auto found = m_byMac.find(macKey);
    return found == m_byMac.end() ? nullptr : found->second;
}

Device &DeviceTable::get(const std::string &id) const {
    Device *device = find(id);
    if (!device)
        throw Refusal(Code::UnknownId, "no device " + id);
    return *device;
}

std::string DeviceTable::newId() {
    // An odd factor reaches every number of 48 bits once, so the ids look unordered and never repeat.
    constexpr std::uint64_t factor = 0x5851f42d4c95ULL;
    const std::uint64_t number = (++m_idCounter * factor) & 0xffffffffffffULL;
    m_store.setValue(counterKey, std::to_string(m_idCounter));
    std::array<char, 16> text{};
    std::snprintf(text.data(), text.size(), "DV%012llx", static_cast<unsigned long long>(number));
    return text.data();
}

void DeviceTable::add(Device device) {
    m_store.saveDevice(device);
    m_devices.push_back(std::make_unique<Device>(std::move(device)));
    index(*m_devices.back());
}

void DeviceTable::update(Device &device, Device changed) {
    m_store.saveDevice(changed);
    m_byMac.erase(device.macKey);
    device = std::move(changed);
    index(device);
}

void DeviceTable::saveState(const Device &device) {
    m_store.saveDeviceState(device);
}

void DeviceTable::setSecret(Device &device, const std::string &secret) {
    device.secret = secret;
    m_store.saveDeviceSecret(device);
}

void DeviceTable::remove(const std::unordered_set<std::string> &ids) {
    if (ids.empty())
        return;
    Transaction transaction(m_store.database());
    for (const std::string &id : ids)
        m_store.removeDevice(id);
    transaction.commit();
    std::erase_if(m_devices, [&](const std::unique_ptr<Device> &device) {
        if (!ids.contains(device->id))
            return false;
        m_byId.erase(device->id);
        m_byMac.erase(device->macKey);
        return true;
    });
}

void DeviceTable::leaveSites(const std::unordered_set<std::string> &sites) {
    if (sites.empty())
        return;
    Transaction transaction(m_store.database());
    for (const auto &device : m_devices)
        if (std::erase_if(device->sites, [&](const std::string &site) { return sites.contains(site); }) != 0)
            m_store.saveDeviceSites(*device);
    transaction.commit();
}

std::string DeviceTable::pageText(Page page) const {
    return joined(page, 1200, [](std::string &text, const Device &device) { text += recordText(device); });
}

std::string DeviceTable::statusText(Page page) const {
    return joined(page, 130, &appendStatus);
}

DeviceTable::Counts DeviceTable::counts() const {
    Counts counts;
    for (const auto &device : m_devices) {
        counts.unreachable += device->reachable ? 0 : 1;
        counts.authorized += device->authorization == Authorization::Authorized ? 1 : 0;
        counts.busy += device->action == standby ? 0 : 1;
    }
    return counts;
}

void DeviceTable::index(Device &device) {
    m_byId[device.id] = &device;
    if (!device.macKey.empty())
        m_byMac[device.macKey] = &device;
}

template <typename Append>
std::string DeviceTable::joined(Page page, std::size_t sizeHint, Append append) const {
    const std::size_t first = std::min(page.start, m_devices.size());
    const std::size_t last = first + std::min(page.count, m_devices.size() - first);
    std::string text = "[";
    text.reserve((last - first) * sizeHint + 2);
    for (std::size_t i = first; i < last; ++i) {
        text += i == first ? "" : ",";
        append(text, *m_devices[i]);
    }
    return text + ']';
}

std::string macKeyOf(std::string_view mac) {
    std::string key;
    for (const char c : mac) {
        if (c == ':' || c == '-' || c == '.' || c == ' ')
            continue;
        const char upper = c >= 'a' && c <= 'f' ? static_cast<char>(c - 'a' + 'A') : c;
        if (!((upper >= '0' && upper <= '9') || (upper >= 'A' && upper <= 'F')))
            return {};
        key += upper;
    }
    return key.size() == 12 ? key : std::string();
}

std::string recordText(const Device &device) {
    return device.body.substr(0, device.body.size() - 1) + R"(,"siteid":)" + sitesText(device) + '}';
}

std::string_view nameOf(Authorization authorization) {
    return authorizationNames[static_cast<std::size_t>(authorization)];
}

bool authorizationOf(std::string_view name, Authorization &authorization) {
    const auto found = std::find(authorizationNames.begin(), authorizationNames.end(), name);
    if (found == authorizationNames.end())
        return false;
    authorization = static_cast<Authorization>(found - authorizationNames.begin());
    return true;
}

} // namespace emulator
