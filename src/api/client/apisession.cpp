// The session with the service and the service's settings.

#include "api/client/apiclient.h"

#include "api/transport/httpexchange.h"
#include "platform/crypto/ciphers.h"
#include "platform/log/messagelog.h"
#include "store/localstore.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <iostream>

namespace {

constexpr std::chrono::milliseconds probeWait{2000};
constexpr std::chrono::milliseconds probeTotal{4000};

/// The settings that the service takes, in the order in which they are sent.
constexpr const char *settingKeys[] = {"nf_alarms",
                                       "nf_tasks",
                                       "svr_fw_upload_limit_enabled",
                                       "svr_fw_upload_limit",
                                       "log_keepdays",
                                       "rp_download_path",
                                       "rp_auto",
                                       "rp_keepnum",
                                       "sys_lang",
                                       "ui_lang"};

} // namespace

unsigned CApiClient::isServerOnline(std::uint32_t &uOnline) {
    uOnline = 0;
    try {
        HttpRequest request;
        request.host = m_strHost;
        request.port = m_uPort;
        request.verb = "GET";
        request.path = "/isalive";
        request.contentType = "text/plain";
        request.authorization = freshGenericToken();
        request.waitTimeout = probeWait;
        request.totalTimeout = probeTotal;
        request.headOnly = true;
        qDebug("CApiClient::isServerOnline > Set authorization to %s",
               MessageLog::secret(request.authorization).constData());
        const HttpResponse answer = exchange(request);
        if (!answer.arrived) {
            std::cout << "HTTP error: " << answer.error << std::endl;
            qDebug("CApiClient::isServerOnline > HTTP error %s", answer.error.c_str());
            return transportResult(answer);
        }
        qDebug("CApiClient::isServerOnline > statsu %d", answer.status);
        if (answer.status != 200)
            return ApiHttpStatusError;
        uOnline = 1;
        return ApiOk;
    } catch (const std::exception &error) {
        std::cout << "API Client Error: " << error.what() << std::endl;
        qDebug("CApiClient::isServerOnline > API Client Error: %s", error.what());
    }
    return ApiException;
}

unsigned CApiClient::loginServer(const char *szAccount, const char *szPassword) {
    if (isEmpty(szAccount) || isEmpty(szPassword))
        return ApiInvalidArgument;
    const std::optional<std::string> cipher = Ciphers::sealSecret(szPassword);
    if (!cipher)
        return ApiCipherFailure;
    m_strAccess.clear();
    const Call call{.method = "loginServer",
                    .path = "/v1/login",
                    .genericToken = true,
                    .logTransportError = [](const Call &, const std::string &error) {
                        qDebug("Login occuring error: %s", error.c_str());
                    }};
    const unsigned result = post(call, {{"email", szAccount}, {"pass", *cipher}});
    if (result != ApiOk)
        return result;
    m_strAccount = szAccount;
    if (!m_strAccess.empty())
        CLocalStore::instance().setAccess(QByteArray::fromStdString(m_strAccess));
    return ApiOk;
}

unsigned CApiClient::logoutServer(const char *szSession) {
    if (isEmpty(szSession))
        return ApiInvalidArgument;
    return postAsAccount({.method = "logoutServe",
                          .path = "/v1/logout",
                          .logTransportError =
                              [](const Call &, const std::string &error) {
                                  qDebug("Login occuring error: %s", error.c_str());
                              }},
                         JSON::object());
}

unsigned CApiClient::loadServerSettings(JSON &settings) {
    return postAsAccount({"loadServerSettings", "/v1/config/get", Payload::Ciphered}, JSON::object(),
                         &settings);
}

unsigned CApiClient::saveServerSettings(const JSON &settings) {
    JSON body = JSON::object();
    for (const char *key : settingKeys) {
        if (settings.is_object() && settings.contains(key))
            body[key] = settings.at(key);
    }
    return postAsAccount({"saveServerSettings", "/v1/config/set"}, std::move(body));
}
