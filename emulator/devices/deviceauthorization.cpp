#include "devices/deviceauthorization.h"

#include "simulation/devicemaker.h"
#include "tables/credentials.h"
#include "tables/devicetable.h"
#include "tables/store.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace emulator {

namespace {

constexpr std::int64_t responseMs = 800;
constexpr int maxRefusals = 5;

/// Whether a password opens devices. Devices with the same secret are asked once.
class PasswordTrial {
public:
    explicit PasswordTrial(const std::string &password) : m_password(password) {}

    bool opens(const Device &device) {
        if (device.secret.empty())
            return m_password.size() >= 8;
        const auto [known, isNew] = m_known.try_emplace(device.secret, false);
        if (isNew)
            known->second = opensDevice(m_password, device.secret);
        return known->second;
    }

private:
    const std::string &m_password;
    std::unordered_map<std::string, bool> m_known;
};

} // namespace

DeviceAuthorization::DeviceAuthorization(DeviceTable &devices, Store &store, std::int64_t blockMs)
    : m_devices(devices), m_store(store), m_blockMs(blockMs) {}

void DeviceAuthorization::request(const std::vector<std::string> &ids, const std::string &account,
                                  const std::string &password, std::int64_t nowMs) {
    PasswordTrial trial(password);
    for (const std::string &id : ids) {
        const bool right = account == ownerAccount && trial.opens(m_devices.get(id));
        const Offer offer = right                     ? Offer::Right
                            : account == ownerAccount ? Offer::WrongPassword
                                                      : Offer::OtherAccount;
        m_pending.push_back({nowMs + responseMs, id, offer});
    }
}

void DeviceAuthorization::settle(std::int64_t nowMs) {
    applyDue(nowMs);
    unblockDue(nowMs);
}

void DeviceAuthorization::applyDue(std::int64_t nowMs) {
    const auto due = std::stable_partition(m_pending.begin(), m_pending.end(),
                                           [&](const Pending &pending) { return pending.dueAt > nowMs; });
    if (due == m_pending.end())
        return;
    const std::vector<Pending> ready(std::make_move_iterator(due), std::make_move_iterator(m_pending.end()));
    m_pending.erase(due, m_pending.end());
    Transaction transaction(m_store.database());
    for (const Pending &pending : ready) {
        Device *device = m_devices.find(pending.id);
        if (device && device->reachable)
            apply(*device, pending.offer, nowMs);
    }
    transaction.commit();
}

void DeviceAuthorization::unblockDue(std::int64_t nowMs) {
    std::erase_if(m_blockedUntil, [&](const auto &blocked) {
        Device *device = nowMs < blocked.second ? nullptr : m_devices.find(blocked.first);
        if (device && device->authorization == Authorization::AccountBlocked) {
            device->authorization = Authorization::InvalidPassword;
            m_devices.saveState(*device);
        }
        return nowMs >= blocked.second;
    });
}

void DeviceAuthorization::apply(Device &device, Offer offer, std::int64_t nowMs) {
    // A device that waits for its first password has no account yet to which anything could belong.
    if (m_blockedUntil.contains(device.id) || device.authorization == Authorization::SetPassword)
        return;
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
    if (++device.refusedPasswords >= maxRefusals) {
        device.authorization = Authorization::AccountBlocked;
        device.refusedPasswords = 0;
        m_blockedUntil[device.id] = nowMs + m_blockMs;
    }
    m_devices.saveState(device);
}

void DeviceAuthorization::admit(Device &device) {
    Device admitted = device;
    admitted.authorization = Authorization::Authorized;
    admitted.refusedPasswords = 0;
    Json record = Json::parse(device.body);
    fillDetails(record, "device-" + device.id.substr(device.id.size() - 4));
    setRecord(admitted, std::move(record));
    m_devices.update(device, std::move(admitted));
}

} // namespace emulator
