// Commands about accounts and the remote-access service.

#include "control.h"

#include "service.h"

#include <algorithm>
#include <stdexcept>

namespace emulator {

namespace {

constexpr int maxOrganizations = 10000;

int organizationCount(const std::string &text) {
    const bool isNumber = !text.empty() && text.size() <= 5 &&
                          std::all_of(text.begin(), text.end(), [](char c) { return c >= '0' && c <= '9'; });
    if (text == "usual")
        return -1;
    if (!isNumber || std::stoi(text) > maxOrganizations)
        throw std::runtime_error("orb orgs takes a number or \"usual\"");
    return std::stoi(text);
}

} // namespace

std::string Control::runOnAccounts(const Words &words) {
    const std::string command = words.empty() ? std::string() : words[0];
    if (command == "permission" && words.size() == 3) {
        m_service.withModel([&](Model &model) { model.accounts.setPermission(words[1], words[2]); });
        return "ok";
    }
    if (command == "orb" && (words.size() == 2 || words.size() == 3))
        return orb(words);
    throw std::runtime_error("no such command");
}

std::string Control::orb(const Words &words) {
    const std::string &what = words[1];
    const std::string value = words.size() == 3 ? words[2] : std::string();
    const bool isSwitch = value == "on" || value == "off";
    return m_service.withModel([&](Model &model) {
        if (what == "status" && value.empty())
            return "ok added=" + std::to_string(model.orb.isAdded()) + ' ' + model.orb.statusText();
        if (what == "expire" && value.empty())
            model.orb.forgetSignIn();
        else if (what == "orgs")
            model.orb.makeOrganizations(organizationCount(value));
        else if (what == "connected" && isSwitch)
            model.orb.setConnected(value == "on");
        else if (what == "remote-access" && isSwitch)
            model.orb.setRemoteAccess(value == "on");
        else if (what == "disconnect" && value.empty())
            model.orb.disconnect();
        else
            throw std::runtime_error(
                "orb takes status, expire, orgs, connected, remote-access or disconnect");
        return std::string("ok");
    });
}

} // namespace emulator
