#include "devices/deviceoutages.h"

#include "tables/devicetable.h"
#include "tables/records.h"

namespace emulator {

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
