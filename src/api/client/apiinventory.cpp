// Sites, devices, discovery and device states.

#include "api/client/apiclient.h"

#include "platform/crypto/ciphers.h"

#include <nlohmann/json.hpp>

namespace {

constexpr const char *siteRoot = "SR000000000000";
/// The addresses of a network of 16 bits; more would be no answer to a scan.
constexpr int discoveryLimit = 65536;

const char *orRoot(const char *szParent) {
    return szParent && *szParent ? szParent : siteRoot;
}

} // namespace

unsigned CApiClient::addSite(const char *szName, const char *szParent, std::string &strSiteId) {
    if (isEmpty(szName))
        return ApiInvalidArgument;
    JSON data;
    const unsigned result = postAsAccount({"addSite", "/v1/site/new", Payload::Ciphered},
                                          {{"sitename", szName}, {"parentid", orRoot(szParent)}}, &data);
    if (result != ApiOk)
        return result;
    const auto id = data.is_object() ? data.find("siteid") : data.end();
    if (id == data.end() || !id->is_string())
        return ApiMissingData;
    strSiteId = id->get<std::string>();
    return ApiOk;
}

unsigned CApiClient::updateSite(const char *szSiteId, const char *szName, const char *) {
    if (isEmpty(szSiteId) || isEmpty(szName))
        return ApiInvalidArgument;
    return postAsAccount({"updateSite", "/v1/site/update"}, {{"siteid", szSiteId}, {"sitename", szName}});
}

unsigned CApiClient::removeSite(const char *szSiteId) {
    if (isEmpty(szSiteId))
        return ApiInvalidArgument;
    return postAsAccount({"removeSite", "/v1/site/rms"}, {{"siteid", szSiteId}});
}

unsigned CApiClient::listSites(int nStart, int nCount, JSON &sites) {
    return postForPage({"listSites", "/v1/site/list", Payload::Ciphered}, nStart, nCount, sites);
}

unsigned CApiClient::commitSites(const JSON &sites, const char *szStage) {
    if (!isStage(szStage) || !sites.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"commitSites", "/v1/site/commit"}, {{"state", szStage}, {"sites", sites}});
}

unsigned CApiClient::listDevices(int nStart, int nCount, JSON &devices) {
    return postForPage({"listDevices", "/v1/dev/list", Payload::Ciphered}, nStart, nCount, devices);
}

unsigned CApiClient::listDevicesText(int nStart, int nCount, std::string &text) {
    return postAsAccount({"listDevices", "/v1/dev/list", Payload::Ciphered},
                         {{"start", nStart}, {"count", nCount}}, &text);
}

unsigned CApiClient::commitDevices(const JSON &devices, const char *szStage) {
    if (!isStage(szStage) || !devices.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"commitDevices", "/v1/dev/commit"}, {{"state", szStage}, {"devices", devices}});
}

unsigned CApiClient::deviceDiscovery(int nTimeout) {
    return postAsAccount({"deviceDiscovery", "/v1/dev/scan"}, {{"timeout", nTimeout}});
}

unsigned CApiClient::deviceDiscoverByIP(const char *szIp, int nTimeout) {
    if (isEmpty(szIp))
        return ApiInvalidArgument;
    return postAsAccount({"deviceDiscoverByIP", "/v1/dev/scanip"}, {{"ip", szIp}, {"timeout", nTimeout}});
}

unsigned CApiClient::deviceDiscoverByIPs(const char *szFirst, const char *szLast, int nTimeout) {
    if (isEmpty(szFirst) || isEmpty(szLast))
        return ApiInvalidArgument;
    return postAsAccount({"deviceDicoverByIPs", "/v1/dev/scanips"},
                         {{"ip_start", szFirst}, {"ip_end", szLast}, {"timeout", nTimeout}});
}

unsigned CApiClient::discoveredDevices(JSON &devices) {
    const unsigned result =
        postAsAccount({"discoveredDevices", "/v1/dev/scanout", Payload::Ciphered}, JSON::object(), &devices);
    if (result == ApiOk)
        cutTo(devices, discoveryLimit);
    return result;
}

unsigned CApiClient::setPassPolicy(const JSON &devices, const char *szType, int nMinLength,
                                   const char *szTaskId) {
    if (!devices.is_array() || isEmpty(szType) || isEmpty(szTaskId))
        return ApiInvalidArgument;
    return postAsAccount({"setPassPolicy", "/v1/dev/setpolicy"},
                         {{"devices", devices}, {"plen", nMinLength}, {"type", szType}, {"tid", szTaskId}});
}

unsigned CApiClient::authDevices(const JSON &devices, const char *szAccount, const char *szPassword) {
    if (!hasSession() || !devices.is_array() || isEmpty(szAccount) || !szPassword)
        return ApiInvalidArgument;
    const std::optional<std::string> cipher = Ciphers::sealSecret(szPassword);
    if (!cipher)
        return ApiCipherFailure;
    return postAsAccount({"authDevices", "/v1/dev/auth"},
                         {{"devices", devices}, {"acc", szAccount}, {"pass", *cipher}});
}

unsigned CApiClient::listDeviceStatus(int nStart, int nCount, JSON &statuses) {
    return postForPage({"listDeviceStatus", "/v1/dstatus/list", Payload::Ciphered}, nStart, nCount, statuses);
}

unsigned CApiClient::listDeviceStatusText(int nStart, int nCount, std::string &text) {
    return postAsAccount({"listDeviceStatus", "/v1/dstatus/list", Payload::Ciphered},
                         {{"start", nStart}, {"count", nCount}}, &text);
}
