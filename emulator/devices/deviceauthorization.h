#pragma once

#include "tables/records.h"

#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

namespace emulator {

class DeviceTable;
class Store;

/// Lets the service into devices: the outcome of credentials shows a moment after they were given.
class DeviceAuthorization {
public:
    DeviceAuthorization(DeviceTable &devices, Store &store, std::int64_t blockMs);

    void request(const std::vector<std::string> &ids, const std::string &account, const std::string &password,
                 std::int64_t nowMs);

    /// Authorizes the service, also where the device has denied or blocked it.
    void admit(Device &device);

    /// Applies the outcomes that are due.
    void settle(std::int64_t nowMs);

private:
    enum class Offer { Right, WrongPassword, OtherAccount };
    struct Pending {
        std::int64_t dueAt = 0;
        std::string id;
        Offer offer = Offer::Right;
    };

    void applyDue(std::int64_t nowMs);
    void unblockDue(std::int64_t nowMs);
    void apply(Device &device, Offer offer, std::int64_t nowMs);
    void refusePassword(Device &device, std::int64_t nowMs);

    DeviceTable &m_devices;
    Store &m_store;
    std::int64_t m_blockMs;
    std::vector<Pending> m_pending;
    std::unordered_map<std::string, std::int64_t> m_blockedUntil;
};

} // namespace emulator
