#pragma once

#include "http/jsonaccess.h"
#include "tables/records.h"

#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>
#include <vector>

namespace emulator {

class Store;

/// The managed devices with their statuses, in the order in which they were added.
class DeviceTable {
public:
    explicit DeviceTable(Store &store);

    std::size_t size() const { return m_devices.size(); }
    Device &at(std::size_t index) const { return *m_devices[index]; }

    /// Null where there is none.
    Device *find(const std::string &id) const;
    Device *findByMac(const std::string &macKey) const;
    /// The device of an id; throws Refusal(UnknownId).
    Device &get(const std::string &id) const;

    /// An id that no device has or had.
    std::string newId();

    void add(Device device);
    /// Keeps the changed record of a device, whose MAC may be another one now.
    void update(Device &device, Device changed);
    void saveState(const Device &device);
    void setSecret(Device &device, const std::string &secret);
    void remove(const std::unordered_set<std::string> &ids);
    /// Takes sites that went out of every device.
    void leaveSites(const std::unordered_set<std::string> &sites);

    std::string pageText(Page page) const;
    std::string statusText(Page page) const;

    struct Counts {
        std::size_t unreachable = 0;
        std::size_t authorized = 0;
        std::size_t busy = 0;
    };
    Counts counts() const;

private:
    void index(Device &device);
    template <typename Append>
    std::string joined(Page page, std::size_t sizeHint, Append append) const;

    Store &m_store;
    std::vector<std::unique_ptr<Device>> m_devices;
    std::unordered_map<std::string, Device *> m_byId;
    std::unordered_map<std::string, Device *> m_byMac;
    std::uint64_t m_idCounter = 0;
};

/// The MAC without case and separators; empty for a text that is none.
std::string macKeyOf(std::string_view mac);

/// The device's record as it travels.
std::string recordText(const Device &device);

/// The name of an authorization and back; false for an unknown name.
std::string_view nameOf(Authorization authorization);
bool authorizationOf(std::string_view name, Authorization &authorization);

} // namespace emulator
