// Commands that the service runs on devices, and the configuration of devices.

#include "api/client/apiclient.h"

#include "api/transport/httpexchange.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

/// The settings of a quick setup, in the order in which they are sent.
constexpr const char *quickSetupKeys[] = {
    "posixTz", "timesync", "time",    "powerfreq", "mute",           "server1",       "server2",
    "server3", "server4",  "server5", "date",      "daylightEnable", "updateInterval"};

} // namespace

unsigned CApiClient::listCgis(int nStart, int nCount, JSON &cgis) {
    return postForPage({"listCgis", "/v1/cgi/list", Payload::Ciphered}, nStart, nCount, cgis);
}

unsigned CApiClient::commitCgis(const JSON &cgis, const char *szStage) {
    if (!isStage(szStage) || !cgis.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"commitCgis", "/v1/cgi/commit"}, {{"state", szStage}, {"cgis", cgis}});
}

unsigned CApiClient::runCustomCgis(const JSON &cgis, const JSON &devices) {
    if (!cgis.is_array() || !devices.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"runCustomCgis", "/v1/cgi/custom"}, {{"cgis", cgis}, {"devices", devices}});
}

unsigned CApiClient::runCustomCgisEx(const JSON &cgis, const JSON &devices, JSON &answers) {
    if (!cgis.is_array() || !devices.is_array())
        return ApiInvalidArgument;
    return postAsAccount({"runCustomCgisEx", "/v1/cgi/customx", Payload::Plain},
                         {{"cgis", cgis}, {"devices", devices}}, &answers);
}

unsigned CApiClient::runGeneralCgis(const char *szPath, const JSON &body) {
    if (isEmpty(szPath) || !body.is_object() || !body.contains("devices"))
        return ApiInvalidArgument;
    return postAsAccount({.method = "runGeneralCgis",
                          .path = szPath,
                          .logAnswer =
                              [](const Call &call, const HttpResponse &answer) {
                                  qDebug("Request %s gets result: %s", call.path,
                                         answer.loggedBody().c_str());
                              }},
                         body);
}

unsigned CApiClient::runQuickSetup(const JSON &devices, const JSON &settings, JSON &answer) {
    if (!devices.is_array())
        return ApiInvalidArgument;
    JSON body = {{"devices", devices}};
    for (const char *key : quickSetupKeys) {
        if (const auto value = settings.find(key); value != settings.end())
            body[key] = *value;
    }
    return postAsAccount({"runQuickSetup", "/v1/quicksetup", Payload::Plain}, std::move(body), &answer);
}

unsigned CApiClient::runConfigQuery(const char *szDeviceId, JSON &configuration) {
    if (isEmpty(szDeviceId))
        return ApiInvalidArgument;
    return postAsAccount({"runConfigQuery", "/v1/config/query", Payload::Plain}, {{"deviceid", szDeviceId}},
                         &configuration);
}

unsigned CApiClient::setTemplate(const JSON &devices, const char *szTemplate, JSON &answer) {
    if (!devices.is_array() || isEmpty(szTemplate))
        return ApiInvalidArgument;
    return postAsAccount({"setTemplate", "/v1/config/config", Payload::Plain},
                         {{"devices", devices}, {"template", szTemplate}}, &answer);
}
