// The service's link with the remote-access service.

#include "api/client/apiclient.h"

#include "api/client/orbservicestatus.h"
#include "platform/crypto/ciphers.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

/// A switch of an answer; nothing where it is missing or no boolean.
std::optional<bool> flag(const JSON &object, const char *name) {
    if (!object.is_object() || !object.contains(name) || !object.at(name).is_boolean())
        return std::nullopt;
    return object.at(name).get<bool>();
}

/// The remote-access switch of a status record.
std::optional<bool> remoteAccessOf(const JSON &data) {
    return data.is_object() && data.contains("remoteAccess") ? flag(data.at("remoteAccess"), "enable")
                                                             : std::nullopt;
}

/// The new state: alone, as an object with the switch, or as a status record.
std::optional<bool> switchedState(const JSON &data) {
    if (data.is_boolean())
        return data.get<bool>();
    const std::optional<bool> state = flag(data, "enable");
    return state ? state : remoteAccessOf(data);
}

} // namespace

unsigned CApiClient::postAboutOrb(const char *method, const char *path, JSON body, JSON *cipheredData) {
    Call call{.method = method, .path = path};
    call.payload = cipheredData ? Payload::Ciphered : Payload::None;
    call.logTransportError = [](const Call &failed, const std::string &error) {
        qWarning("Encountered HTTP request error when CApiClient::%s: %s", failed.method, error.c_str());
    };
    call.logException = [](const Call &failed, const std::string &error) {
        qWarning("Encountered unexpected error when CApiClient::%s: %s", failed.method, error.c_str());
    };
    return postAsAccount(call, std::move(body), cipheredData);
}

unsigned CApiClient::addService(const char *szOrgId, const char *szSiteId) {
    if (isEmpty(szOrgId) || isEmpty(szSiteId))
        return ApiInvalidArgument;
    return postAboutOrb("addService", "/v1/orb/add_service", {{"org_id", szOrgId}, {"site_id", szSiteId}});
}

unsigned CApiClient::authenticateWithOrb(const char *szEmail, const char *szPassword) {
    if (isEmpty(szEmail) || isEmpty(szPassword))
        return ApiInvalidArgument;
    const std::optional<std::string> cipher = Ciphers::sealSecret(szPassword);
    if (!cipher)
        return ApiCipherFailure;
    return postAboutOrb("authenticateWithOrb", "/v1/orb/login", {{"email", szEmail}, {"login", *cipher}});
}

unsigned CApiClient::browseOrbOrgs(JSON &organizations) {
    return postAboutOrb("browseOrbOrgs", "/v1/orb/orgs", JSON::object(), &organizations);
}

unsigned CApiClient::disconnectOrbService() {
    return postAboutOrb("disconnectOrbService", "/v1/orb/logout_service", JSON::object());
}

unsigned CApiClient::getOrbServiceCachedStatus(OrbServiceStatus &status) {
    JSON data;
    const unsigned result =
        postAboutOrb("getOrbServiceCachedStatus", "/v1/orb/cache/status", JSON::object(), &data);
    if (result != ApiOk)
        return result;
    if (!data.is_object())
        return ApiMissingData;
    const std::optional<bool> remoteAccess = remoteAccessOf(data);
    if (!remoteAccess)
        return ApiMissingData;
    status.machineUuid = textMember(data, "machineUUID");
    status.deviceId = textMember(data, "deviceId");
    status.connected = flag(data, "connected").value_or(false);
    status.remoteAccess = *remoteAccess;
    return ApiOk;
}

unsigned CApiClient::isOrbServiceAdded(bool &bAdded) {
    JSON data;
    const unsigned result =
        postAboutOrb("isOrbServiceAdded", "/v1/orb/cache/is_service_added", JSON::object(), &data);
    if (result != ApiOk)
        return result;
    const std::optional<bool> added = flag(data, "is_orb_service_added");
    if (!added)
        return ApiMissingData;
    bAdded = *added;
    return ApiOk;
}

unsigned CApiClient::toggleRemoteAccess(bool bEnable, bool &bState) {
    JSON data;
    const unsigned result =
        postAboutOrb("toggleRemoteAccess", "/v1/orb/remote_access", {{"enable", bEnable}}, &data);
    if (result != ApiOk)
        return result;
    const std::optional<bool> state = switchedState(data);
    if (!state)
        return ApiMissingData;
    bState = *state;
    return ApiOk;
}
