#include "devices/devicecommands.h"

#include "devices/addressbook.h"
#include "devices/passwordpolicy.h"
#include "simulation/devicemaker.h"
#include "tables/credentials.h"
#include "tables/records.h"

#include <algorithm>
#include <sstream>

namespace emulator {

namespace {

constexpr auto setParameters = "/cgi-bin/admin/setparam.cgi";
constexpr auto editAccount = "/cgi-bin/admin/editaccount.cgi";
constexpr std::string_view restoreExcept = "system_restoreexcept";

bool isSet(const DeviceCommand &command, std::string_view name, std::string_view value) {
    const std::string *found = command.find(name);
    return command.path == setParameters && found && *found == value;
}

bool restoresAll(const DeviceCommand &command) {
    return isSet(command, "system_restore", "1");
}

bool restoresSome(const DeviceCommand &command) {
    return command.path == setParameters &&
           std::any_of(command.parameters.begin(), command.parameters.end(),
                       [](const auto &parameter) { return parameter.first.starts_with(restoreExcept); });
}

bool keeps(const DeviceCommand &command, const char *part) {
    return isSet(command, std::string(restoreExcept) + part, "1");
}

std::string textIn(const Json &record, const char *name) {
    const Json value = record.value(name, Json());
    return value.is_string() ? value.get<std::string>() : std::string();
}

/// The settings of a new device, but for the parts that a restore may keep.
Json factorySettings() {
    return {{"d_audio", "unmute"},
            {"d_powerfreq", 50},
            {"d_apstate", 0},
            {"d_policy", {{"plen", 8}, {"type", 0}}},
            {"d_packages", nullptr}};
}

Json factoryNetwork(const Device &device, AddressBook &addresses) {
    const Json record = Json::parse(device.body);
    const std::string tail = device.macKey.size() == 12 ? device.macKey.substr(6) : std::string("000000");
    return {{"d_ip", addresses.lease(device)},
            {"d_nettype", "dhcp"},
            {"d_http", 80},
            {"d_https", 443},
            {"d_hostname", textIn(record, "d_model") + '-' + tail},
            {"https_enable", false},
            {"ieee8021x_enable", false},
            {"d_has_matching_cert", false},
            {"d_has_matching_private_key", false},
            {"d_has_matching_cert_request", false},
            {"d_cert_subject", nullptr},
            {"d_cert_expires", nullptr},
            {"d_8021x_expires", nullptr}};
}

void addRestore(DeviceWork &work, const Device &device, const DeviceCommand &command,
                AddressBook &addresses) {
    const bool all = restoresAll(command);
    work.changes.update(factorySettings());
    if (all || !keeps(command, "net"))
        work.changes.update(factoryNetwork(device, addresses));
    if (all || !keeps(command, "dst"))
        work.changes["d_daylight"] = nullptr;
    work.forgetsAccount |= all;
    work.restarts = true;
}

} // namespace

const std::string *DeviceCommand::find(std::string_view name) const {
    const auto found = std::find_if(parameters.begin(), parameters.end(),
                                    [&](const auto &parameter) { return parameter.first == name; });
    return found == parameters.end() ? nullptr : &found->second;
}

DeviceCommand readCommand(const std::string &text) {
    const auto question = text.find('?');
    DeviceCommand command;
    command.path = text.substr(0, question);
    std::istringstream query(question == std::string::npos ? std::string() : text.substr(question + 1));
    for (std::string parameter; std::getline(query, parameter, '&');) {
        const auto equals = parameter.find('=');
        command.parameters.emplace_back(parameter.substr(0, equals), equals == std::string::npos
                                                                         ? std::string()
                                                                         : parameter.substr(equals + 1));
    }
    return command;
}

CommandSeries::CommandSeries(const std::vector<std::string> &commands) {
    for (const std::string &text : commands) {
        const DeviceCommand &command = m_commands.emplace_back(readCommand(text));
        const std::string *password = command.path == editAccount ? command.find("userpass") : nullptr;
        m_secret = password ? deviceSecret(*password) : m_secret;
        if (restoresAll(command) || restoresSome(command))
            m_action = "deviceRestore";
        else if (isSet(command, "system_reset", "0") && m_action.empty())
            m_action = "deviceRestart";
    }
}

DeviceWork CommandSeries::workOf(const Device &device, AddressBook &addresses) const {
    DeviceWork work;
    work.id = device.id;
    work.restarts = !m_action.empty();
    for (const DeviceCommand &command : m_commands)
        if (command.path == editAccount)
            judgeEdit(device, command, work);
        else if (restoresAll(command) || restoresSome(command))
            addRestore(work, device, command, addresses);
        else if (!command.path.starts_with("/cgi-bin/"))
            work.failure = "pTaskUnsupportedMethod";
    return work;
}

void CommandSeries::judgeEdit(const Device &device, const DeviceCommand &command, DeviceWork &work) const {
    const std::string *method = command.find("method");
    const std::string *account = command.find("username");
    const std::string *password = command.find("userpass");
    const bool isNew = device.authorization == Authorization::SetPassword;
    work.access = Access::FirstOwner;
    if (!method || *method != "edit")
        work.failure = "pTaskUnsupportedMethod";
    else if (!account || !password || !isDeviceAccount(*account) || (isNew && *account != ownerAccount) ||
             !allowsPassword(device, *account, *password))
        work.failure = "pTaskFailedToSetPassword";
    else if (*account == ownerAccount)
        work.secret = m_secret;
}

} // namespace emulator
