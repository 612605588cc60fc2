#pragma once

#include <string>

namespace emulator {

struct Device;

/// True when the device takes the password for the account: it has the length and the kinds of characters
/// that the policy in the device's record asks for, and none that its interface does not know.
bool allowsPassword(const Device &device, const std::string &account, const std::string &password);

} // namespace emulator
