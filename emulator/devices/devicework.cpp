#include "devices/devicework.h"

#include "simulation/devicemaker.h"
#include "tables/devicetable.h"
#include "tables/records.h"

namespace emulator {

namespace {

void changeAccount(DeviceTable &devices, Device &device, const DeviceWork &work) {
    const bool isFirst = device.authorization == Authorization::SetPassword;
    device.authorization = work.forgetsAccount ? Authorization::SetPassword
                           : isFirst           ? Authorization::Unauthorized
                                               : Authorization::InvalidPassword;
    device.refusedPasswords = 0;
    devices.setSecret(device, work.secret);
    devices.saveState(device);
}

} // namespace

Json toJson(const DeviceWork &work) {
    return {{"id", work.id},
            {"changes", work.changes},
            {"restarts", work.restarts},
            {"failure", work.failure},
            {"access", static_cast<int>(work.access)},
            {"secret", work.secret},
            {"forgets", work.forgetsAccount}};
}

DeviceWork deviceWorkOf(const Json &kept) {
    DeviceWork work;
    work.id = kept.value("id", work.id);
    work.changes = kept.value("changes", work.changes);
    work.restarts = kept.value("restarts", work.restarts);
    work.failure = kept.value("failure", work.failure);
    work.access = static_cast<Access>(kept.value("access", static_cast<int>(work.access)));
    work.secret = kept.value("secret", work.secret);
    work.forgetsAccount = kept.value("forgets", work.forgetsAccount);
    return work;
}

bool isPermitted(const Device &device, Access access) {
    const bool isNew = device.authorization == Authorization::SetPassword;
    return access == Access::Anyone || device.authorization == Authorization::Authorized ||
           (access == Access::FirstOwner && isNew);
}

void apply(DeviceTable &devices, Device &device, const DeviceWork &work) {
    if (!work.changes.empty())
        devices.update(device, withMembers(device, work.changes));
    if (!work.secret.empty() || work.forgetsAccount)
        changeAccount(devices, device, work);
}

void DeviceOutages::begin(Device &device, const std::string &action, std::int64_t endsAt) {
    device.reachable = false;
    m_outages[device.id] = {endsAt, action};
}

void DeviceOutages::endOf(const std::string &deviceId, std::int64_t nowMs) {
    const auto outage = m_outages.find(deviceId);
    if (outage != m_outages.end() && outage->second.endsAt <= nowMs) {
        end(deviceId, outage->second);
        m_outages.erase(outage);
    }
}

void DeviceOutages::endDue(std::int64_t nowMs) {
    std::erase_if(m_outages, [&](const auto &entry) {
        const bool ends = entry.second.endsAt <= nowMs;
        if (ends)
            end(entry.first, entry.second);
        return ends;
    });
}

void DeviceOutages::end(const std::string &deviceId, const Outage &outage) {
    if (Device *device = m_devices.find(deviceId)) {
        device->reachable = !device->held;
        device->action = device->action == outage.action ? standby : device->action;
    }
}

} // namespace emulator
