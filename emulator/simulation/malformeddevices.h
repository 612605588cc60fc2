#pragma once

namespace emulator {

class DeviceTable;

/// Adds records such as old or broken devices leave in a service: members missing, of wrong types, hostile.
void addOddRecords(DeviceTable &devices);

} // namespace emulator
