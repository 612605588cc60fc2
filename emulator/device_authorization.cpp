#include "device_authorization.h"

#include "device_maker.h"
#include "device_table.h"
#include "store.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace emulator {

namespace {

constexpr std::int64_t answerMs = 800;
constexpr std::int64_t blockMs = 60000;
constexpr int mostRefusals = 3;

} // namespace

DeviceAuthorization::DeviceAuthorization(DeviceTable &devices, Store &store)
    : m_devices(devices), m_store(store) {}

void DeviceAuthorization::request(const std::vector<std::string> &ids, const std::string &account,
                                  const std::string &password, std::int64_t nowMs) {
    const bool strong = password.size() >= 8;
    const Offer offer = !strong             ? Offer::WrongPassword
                        : account == "root" ? Offer::Right
                                            : Offer::OtherAccount;
    m_pending.push_back({nowMs + answerMs, ids, offer});
}

void DeviceAuthorization::settle(std::int64_t nowMs) {
    const auto due = std::stable_partition(m_pending.begin(), m_pending.end(),
                                           [&](const Pending &pending) { return pending.dueAt > nowMs; });
    if (due == m_pending.end()) {
        return;
    }
    const std::vector<Pending> ready(std::make_move_iterator(due), std::make_move_iterator(m_pending.end()));
    m_pending.erase(due, m_pending.end());
    Transaction transaction(m_store.database());
    for (const Pending &pending : ready) {
        for (const std::string &id : pending.ids) {
            Device *device = m_devices.find(id);
            if (device && device->reachable) {
                apply(*device, pending.offer, nowMs);
            }
        }
    }
    transaction.commit();
}

void DeviceAuthorization::apply(Device &device, Offer offer, std::int64_t nowMs) {
    const auto blocked = m_blockedUntil.find(device.id);
    if (blocked != m_blockedUntil.end() && nowMs < blocked->second) {
        return;
    }
    switch (offer) {
    case Offer::Right:
        admit(device);
        break;
    case Offer::WrongPassword:
        refusePassword(device, nowMs);
        break;
    case Offer::OtherAccount:
        device.authorization = Authorization::AccessDenied;
        m_devices.saveState(device);
        break;
    }
}

void DeviceAuthorization::refusePassword(Device &device, std::int64_t nowMs) {
    device.authorization = Authorization::InvalidPassword;
    if (++device.refusedPasswords >= mostRefusals) {
        device.authorization = Authorization::AccountBlocked;
        device.refusedPasswords = 0;
        m_blockedUntil[device.id] = nowMs + blockMs;
    }
    m_devices.saveState(device);
}

void DeviceAuthorization::admit(Device &device) {
    Device admitted = device;
    admitted.authorization = Authorization::Authorized;
    admitted.refusedPasswords = 0;
    Json record = Json::parse(device.body);
    learn(record, "device-" + device.id.substr(device.id.size() - 4));
    setRecord(admitted, std::move(record));
    m_devices.update(device, std::move(admitted));
}

} // namespace emulator
