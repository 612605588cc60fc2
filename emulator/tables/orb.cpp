#include "tables/orb.h"

#include "http/response.h"
#include "tables/store.h"

#include <algorithm>

namespace emulator {

namespace {

constexpr auto storeKey = "orb";
constexpr auto siteNames = {"Head office", "Warehouse", "Branch"};

Json organization(int number, const std::string &name, bool remoteAccess, std::size_t sites) {
    const std::string id = "ORG" + std::to_string(number);
    Json made = {{"organizationID", id},
                 {"organizationName", name},
                 {"enableRemoteAccess", remoteAccess},
                 {"sites", Json::array()}};
    for (const char *site : siteNames) {
        const std::size_t index = made["sites"].size();
        if (index < sites)
            made["sites"].push_back({{"id", id + "-S" + std::to_string(index + 1)}, {"name", site}});
    }
    return made;
}

Json defaultOrganizations() {
    return Json::array({organization(1, "Harbour Logistics", true, 3),
                        organization(2, "Riverside Schools", false, 2),
                        organization(3, "Alder Retail", true, 0)});
}

const Json *withMember(const Json &list, const char *name, const std::string &value) {
    const auto found =
        std::find_if(list.begin(), list.end(), [&](const Json &record) { return record.at(name) == value; });
    return found == list.end() ? nullptr : &*found;
}

} // namespace

Orb::Orb(Store &store, std::int64_t signInMs)
    : m_store(store),
      m_signInMs(signInMs),
      m_state({{"users", Json::object()}, {"organizations", defaultOrganizations()}}) {
    const std::string kept = store.value(storeKey);
    if (!kept.empty())
        m_state = Json::parse(kept);
}

void Orb::keep() {
    m_store.setValue(storeKey, jsonText(m_state));
}

void Orb::setUser(const std::string &email, const User &user) {
    m_state["users"][email] = {{"salt", user.password.salt},
                               {"hash", user.password.hash},
                               {"rounds", user.password.rounds},
                               {"expired", user.expired}};
    keep();
}

Orb::User Orb::user(const std::string &email) const {
    const Json &users = m_state.at("users");
    const auto found = users.find(email);
    if (found == users.end())
        throw Refusal(Code::UnknownRemoteUser, "no such user of the remote-access service");
    return {{found->at("salt"), found->at("hash"), found->at("rounds")}, found->at("expired")};
}

void Orb::signIn(const std::string &email, std::int64_t nowMs) {
    m_state["sign_in"] = {{"email", email}, {"until", nowMs + m_signInMs}};
    keep();
}

void Orb::forgetSignIn() {
    m_state.erase("sign_in");
    keep();
}

const Json &Orb::signedIn(std::int64_t nowMs) const {
    const auto signIn = m_state.find("sign_in");
    if (signIn == m_state.end() || signIn->at("until").get<std::int64_t>() <= nowMs)
        throw Refusal(Code::NotAccepted, "no user is signed in to the remote-access service");
    return m_state.at("organizations");
}

std::string Orb::organizationsText(std::int64_t nowMs) const {
    return jsonText(signedIn(nowMs));
}

void Orb::makeOrganizations(int count) {
    Json made = count < 0 ? defaultOrganizations() : Json::array();
    for (int number = 1; number <= count; ++number)
        made.push_back(organization(number, "Customer " + std::to_string(number), true, siteNames.size()));
    m_state["organizations"] = std::move(made);
    keep();
}

void Orb::add(const std::string &organizationId, const std::string &siteId, std::int64_t nowMs) {
    const Json *wanted = withMember(signedIn(nowMs), "organizationID", organizationId);
    if (!wanted || !withMember(wanted->at("sites"), "id", siteId))
        throw Refusal(Code::UnknownId, "no such organization or site");
    m_state["link"] = {{"organization", organizationId},
                       {"site", siteId},
                       {"machineUUID", fingerprint(siteId).substr(0, 32)},
                       {"deviceId", "ORB" + fingerprint(organizationId).substr(0, 12)},
                       {"connected", true},
                       {"enable", false},
                       {"may_enable", wanted->at("enableRemoteAccess")}};
    m_state.erase("sign_in");
    keep();
}

Json &Orb::link() {
    if (!isAdded())
        throw Refusal(Code::UnknownId, "this service is not added to the remote-access service");
    return m_state["link"];
}

void Orb::disconnect() {
    link();
    m_state.erase("link");
    keep();
}

void Orb::setRemoteAccess(bool on) {
    if (on && link().at("may_enable") == false)
        throw Refusal(Code::NotAllowed, "the organization lets no support in");
    link()["enable"] = on;
    keep();
}

void Orb::setConnected(bool on) {
    link()["connected"] = on;
    keep();
}

std::string Orb::statusText() const {
    const auto found = m_state.find("link");
    const Json link = found == m_state.end() ? Json::object() : *found;
    return jsonText({{"machineUUID", link.value("machineUUID", "")},
                     {"deviceId", link.value("deviceId", "")},
                     {"connected", link.value("connected", false)},
                     {"remoteAccess", {{"enable", link.value("enable", false)}}}});
}

} // namespace emulator
