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
    return access == Access::Anybody || device.authorization == Authorization::Authorized ||
           (access == Access::FirstOwner && isNew);
}

void apply(DeviceTable &devices, Device &device, const DeviceWork &work) {
    if (!work.changes.empty())
        devices.update(device, withMembers(device, work.changes));
    if (!work.secret.empty() || work.forgetsAccount)
        changeAccount(devices, device, work);
}

} // namespace emulator
