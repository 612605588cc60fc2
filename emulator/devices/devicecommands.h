#pragma once

#include "devices/devicework.h"

#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace emulator {

class AddressBook;

/// A command of a device's web interface, taken apart. Values stand as they came: devices of this kind take a
/// percent sign for itself.
struct DeviceCommand {
    std::string path;
    std::vector<std::pair<std::string, std::string>> parameters;

    /// The value of a parameter; null where there is none.
    const std::string *find(std::string_view name) const;
};

DeviceCommand readCommand(const std::string &text);

/// The commands of one request.
class CommandSeries {
public:
    /// Takes its time for a new password; not to be made under the model's lock.
    explicit CommandSeries(const std::vector<std::string> &commands);

    /// The action of a device that gets the commands; empty where they leave it running.
    const std::string &action() const { return m_action; }

    /// What the commands mean for a device.
    DeviceWork workOf(const Device &device, AddressBook &addresses) const;

private:
    void judgeEdit(const Device &device, const DeviceCommand &command, DeviceWork &work) const;

    std::vector<DeviceCommand> m_commands;
    std::string m_action;
    std::string m_secret;
};

} // namespace emulator
