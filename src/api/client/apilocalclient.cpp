#include "api/client/apilocalclient.h"

#include "platform/crypto/ciphers.h"
#include "store/serverkeys.h"

#include <nlohmann/json.hpp>

namespace {

const char *textOrEmpty(const char *text) {
    return text ? text : "";
}

/// Nobody is logged in here, so the codes that end a session have no meaning of their own.
unsigned judgeAccountCode(int code) {
    if (code == 0)
        return ApiOk;
    return code == 107 ? ApiEmailTaken : ApiServerError;
}

unsigned judgeCode(int code) {
    return code == 0 ? ApiOk : ApiServerError;
}

} // namespace

CApiLocalClient::CApiLocalClient(std::uint32_t uPort) : CApiClient("127.0.0.1", uPort) {
    expectServerKey(ServerKeys::instance().fingerprint(ServerKeys::thisComputer));
}

unsigned CApiLocalClient::memberList(int nStart, int nCount, JSON &members) {
    return post({.method = "memberList",
                 .path = "/v1/accm/list",
                 .payload = Payload::Ciphered,
                 .genericToken = true,
                 .judgeCode = judgeCode},
                {{"start", nStart}, {"count", nCount}}, &members);
}

unsigned CApiLocalClient::newMember(const char *szEmail, const char *szPassword, const char *szName,
                                    const char *szPermission, const char *szDescription) {
    if (!szEmail || !szPassword)
        return ApiInvalidArgument;
    const std::optional<std::string> cipher = Ciphers::sealSecret(szPassword);
    // An account without a password is not what anybody asked for.
    if (!cipher)
        return ApiException;
    return post(
        {.method = "newMember", .path = "/v1/accm/new", .genericToken = true, .judgeCode = judgeAccountCode},
        {{"email", szEmail},
         {"pass", *cipher},
         {"name", textOrEmpty(szName)},
         {"permi", textOrEmpty(szPermission)},
         {"desp", textOrEmpty(szDescription)}});
}

unsigned CApiLocalClient::reviseMemberPassword(const char *szEmail, const char *szOld, const char *szNew) {
    if (!szEmail || !szOld || !szNew)
        return ApiInvalidArgument;
    const std::optional<std::string> oldCipher = Ciphers::sealSecret(szOld);
    const std::optional<std::string> newCipher = Ciphers::sealSecret(szNew);
    if (!oldCipher || !newCipher)
        return ApiCipherFailure;
    return post({.method = "reviseMemberPassword",
                 .path = "/v1/accm/revpas",
                 .genericToken = true,
                 .judgeCode = judgeCode},
                {{"email", szEmail}, {"old", *oldCipher}, {"new", *newCipher}});
}
