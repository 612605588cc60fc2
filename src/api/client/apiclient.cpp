#include "api/client/apiclient.h"

#include "api/client/envelope.h"
#include "api/transport/httpexchange.h"
#include "api/transport/transfererror.h"
#include "platform/crypto/ciphers.h"
#include "platform/files/apppaths.h"
#include "platform/log/messagelog.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <cctype>
#include <iostream>
#include <limits>
#include <mutex>
#include <stdexcept>
#include <string_view>
#include <utility>

namespace {

constexpr std::size_t minTokenLength = 16;
constexpr std::size_t maxTokenLength = 256;
constexpr int maxPadding = 2;

const char *textOrEmpty(const char *text) {
    return text ? text : "";
}

/// Header values come percent-decoded, so anything may stand in one; a token is base64url, padded or not.
bool isToken(std::string_view text) {
    const auto isTokenCharacter = [](unsigned char c) { return std::isalnum(c) || c == '-' || c == '_'; };
    if (text.size() < minTokenLength || text.size() > maxTokenLength)
        return false;
    for (int padding = 0; padding < maxPadding && text.back() == '='; ++padding)
        text.remove_suffix(1);
    return std::all_of(text.begin(), text.end(), isTokenCharacter);
}

/// Of the statuses, only these say that nothing was done.
bool isRefusal(int status) {
    return status >= 400 && status < 500;
}

unsigned judgeUsualCode(int code) {
    switch (code) {
    case 0:
        return ApiOk;
    case 105:
        return ApiCode105;
    case 108:
        return ApiCode108;
    default:
        return ApiServerError;
    }
}

/// Only a whole number is a code: a plain conversion would make success of false, 0.5 and 2^32.
int codeOf(const JSON &body) {
    const JSON &code = body.at("code");
    if (!code.is_number_integer())
        throw std::runtime_error("code is no integer");
    constexpr std::int64_t limit = std::numeric_limits<int>::max();
    return static_cast<int>(std::clamp(code.get<std::int64_t>(), -limit, limit));
}

std::string decipher(const Envelope &answer) {
    std::optional<std::string> plain = Ciphers::openData(
        answer.data ? *answer.data : answer.members.at("data").get_ref<const std::string &>());
    if (!plain)
        throw std::runtime_error("data cannot be deciphered");
    return *std::move(plain);
}

} // namespace

CApiClient::CApiClient(const char *szHost, std::uint32_t uPort)
    : m_strHost(textOrEmpty(szHost)), m_uPort(uPort) {}

CApiClient::~CApiClient() = default;

bool CApiClient::setAccessToken(const char *szToken) {
    qDebug("CApiClient::setAccessToken > szToken: %s", MessageLog::secret(QByteArray(szToken)).constData());
    if (!szToken)
        return false;
    const std::optional<std::string> token = Ciphers::openSecret(szToken);
    qDebug("CApiClient::setAccessToken > szRawToken: %s", MessageLog::secret(token.value_or("")).constData());
    if (!token) {
        qDebug("CApiClient::setAccessToken > fail to create szRawToken");
        return false;
    }
    m_strAccess = *token;
    qDebug("CApiClient::setAccessToken end");
    return true;
}

bool CApiClient::setAccount(const char *szAccount) {
    if (!szAccount)
        return false;
    m_strAccount = szAccount;
    return true;
}

bool CApiClient::isStage(const char *szStage) {
    const std::string_view stage = textOrEmpty(szStage);
    return stage == "all" || stage == "start" || stage == "update" || stage == "end";
}

bool CApiClient::hasSession() const {
    return !m_strAccess.empty() && !m_strAccount.empty();
}

unsigned CApiClient::postAsAccount(const Call &call, JSON body, const Output &output) {
    if (!hasSession())
        return ApiInvalidArgument;
    body["id"] = m_strAccount;
    return post(call, body, output);
}

unsigned CApiClient::postForPage(const Call &call, int nStart, int nCount, JSON &records) {
    JSON page;
    const unsigned result = postAsAccount(call, {{"start", nStart}, {"count", nCount}}, &page);
    if (result != ApiOk)
        return result;
    if (page.is_array() && std::cmp_greater(page.size(), nCount)) {
        qWarning("CApiClient::%s > %zu records where %d were asked for", call.method, page.size(), nCount);
        return ApiException;
    }
    records = std::move(page);
    return ApiOk;
}

void CApiClient::cutTo(JSON &list, int nCount) {
    if (!list.is_array() || !std::cmp_greater(list.size(), nCount))
        return;
    qWarning("CApiClient > %zu records came, those after the first %d are dropped", list.size(), nCount);
    list.erase(list.begin() + std::max(nCount, 0), list.end());
}

unsigned CApiClient::post(const Call &call, const JSON &body, const Output &output) {
    return send(
        call,
        [&body](HttpRequest &request) {
            // The service wants this type although the body is JSON.
            request.contentType = "application/x-www-form-urlencoded";
            request.body = dumpJson(body);
        },
        output);
}

unsigned CApiClient::send(const Call &call, const Fill &fill, const Output &output) {
    m_unanswered = false;
    try {
        return exchange(call, fill, output);
    } catch (const TransferError &error) {
        // A form that could not be sent to its end is nothing to the service.
        m_unanswered = false;
        if (m_transfer)
            m_transfer->fail(error.failure(), error.file());
        logException(call, error.what());
        if (error.failure() == TransferFailure::TargetNotWritten)
            return ApiTargetNotWritten;
    } catch (const std::exception &error) {
        logException(call, error.what());
    } catch (...) {
        logException(call, "Unknown exception");
    }
    return ApiException;
}

unsigned CApiClient::exchange(const Call &call, const Fill &fill, const Output &output) {
    HttpRequest request;
    request.host = m_strHost;
    request.port = m_uPort;
    request.verb = "POST";
    request.path = call.path;
    request.authorization = call.genericToken ? freshGenericToken() : m_strAccess;
    request.totalTimeout = m_totalTimeout;
    fill(request);
    qDebug("CApiClient::%s > Set authorization to %s", call.method,
           MessageLog::secret(request.authorization).constData());
    m_unanswered = true;
    const HttpResponse answer = exchange(request);
    if (!answer.arrived) {
        m_unanswered = answer.wasSent;
        std::cout << call.transportError << answer.error << std::endl;
        if (call.logTransportError)
            call.logTransportError(call, answer.error);
        return transportResult(answer);
    }
    if (call.logAnswer)
        call.logAnswer(call, answer);
    const unsigned result = judge(call, answer, output);
    m_unanswered = result == ApiMissingData || (result == ApiHttpStatusError && !isRefusal(answer.status));
    return result;
}

HttpResponse CApiClient::exchange(HttpRequest &request) {
    request.expectedKey = m_strExpectedKey;
    HttpResponse answer = exchangeHttp(request);
    m_strServerKey = answer.serverKey;
    return answer;
}

unsigned CApiClient::transportResult(const HttpResponse &answer) {
    return answer.keyChanged ? ApiKeyChanged : ApiTransportError;
}

std::string CApiClient::freshGenericToken() {
    if (std::optional<std::string> token = Ciphers::genericToken())
        return *std::move(token);
    static std::once_flag told;
    std::call_once(told, [] {
        qWarning("The key file %s cannot be used; nothing is sent", qUtf8Printable(AppPaths::keyFile()));
    });
    throw std::runtime_error("no generic token");
}

void CApiClient::logException(const Call &call, const std::string &error) {
    std::cout << "API Client Error: " << error << std::endl;
    if (call.logException)
        call.logException(call, error);
}

unsigned CApiClient::judge(const Call &call, const HttpResponse &answer, const Output &output) {
    if (answer.status != 200)
        return ApiHttpStatusError;
    if (answer.isFile) {
        renewToken(call, answer.authorization);
        return ApiOk;
    }
    const Envelope body = call.payload == Payload::Ciphered ? Envelope::open(answer.body)
                                                            : Envelope{parseJson(answer.body), {}};
    const unsigned result = (call.judgeCode ? call.judgeCode : judgeUsualCode)(codeOf(body.members));
    if (result != ApiOk)
        return result;
    renewToken(call, answer.authorization);
    if (call.payload == Payload::File)
        return ApiMissingData;
    if (call.payload == Payload::None || output.isEmpty())
        return ApiOk;
    const auto data = body.members.find("data");
    if (data == body.members.end())
        return ApiMissingData;
    if (output.text)
        *output.text = decipher(body);
    else
        *output.value = call.payload == Payload::Ciphered ? parseJson(decipher(body)) : *data;
    return ApiOk;
}

void CApiClient::renewToken(const Call &call, const std::string &token) {
    if (token.empty())
        return;
    if (!isToken(token)) {
        qWarning("CApiClient::%s > the renewed token is malformed and was not taken", call.method);
        return;
    }
    m_strAccess = token;
    const std::string begin =
        call.renewal ? call.renewal : std::string("CApiClient::") + call.method + " > m_strAccess: ";
    qDebug("%s%s", begin.c_str(), MessageLog::secret(m_strAccess).constData());
}
