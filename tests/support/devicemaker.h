#pragma once

#include "devices/inventory/deviceinventory.h"

#include <nlohmann/json.hpp>

#include <memory>
#include <utility>
#include <vector>

/// Records and inventories for tests of what shows or orders them.
namespace DeviceMaker {

/// A camera with a text id of its own and the given members.
inline JSON record(int number, const JSON &members = JSON::object()) {
    JSON value = {{"id", "DV" + std::to_string(number)}, {"d_svrtype", "Camera"}};
    value.update(members);
    return value;
}

/// A camera whose address grows and whose host name shrinks with its number.
inline JSON camera(int number) {
    return record(number,
                  {{"d_ip", "10.0." + std::to_string(number / 250) + '.' + std::to_string(number % 250)},
                   {"d_hostname", "host-" + std::to_string(99999 - number)}});
}

inline DeviceSnapshotPtr snapshot(const std::vector<JSON> &values) {
    std::vector<DeviceRecordPtr> records;
    for (const JSON &value : values)
        records.push_back(DeviceRecords::parse(value));
    return std::make_shared<DeviceSnapshot>(std::move(records));
}

/// Cameras with the numbers from first to the one before last.
inline std::vector<JSON> cameras(int first, int last) {
    std::vector<JSON> values;
    for (int number = first; number < last; ++number)
        values.push_back(camera(number));
    return values;
}

} // namespace DeviceMaker
