// Files for devices, and the files of exports.

#include "api/client/apiclient.h"

#include "api/transport/downloadtarget.h"
#include "api/transport/httpexchange.h"
#include "api/transport/multipartbody.h"
#include "api/transport/transfererror.h"
#include "store/clientstore.h"
#include "store/localstore.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <map>
#include <optional>
#include <string_view>

namespace {

constexpr const char *selfSignedMembers[] = {"mode",     "https_port", "country",  "state",
                                             "locality", "org",        "org_unit", "validity"};

using Parts = std::vector<UploadPart>;

Parts image(const char *szPath, const char *szFileName) {
    return {{"fimage", szPath, szFileName}};
}

UploadPart caPart(const char *szPath, const char *szFileName) {
    return {"ca_", szPath, szFileName};
}

/// A file of each device, by its MAC; nothing when the list is empty or an entry lacks something.
std::optional<std::map<std::string, UploadPart>> filesByMac(const JSON &list, const char *prefix) {
    std::map<std::string, UploadPart> files;
    if (!list.is_array())
        return std::nullopt;
    for (const JSON &entry : list) {
        const std::string mac(textMember(entry, "d_mac"));
        UploadPart part{prefix + mac, std::string(textMember(entry, "fpath")),
                        std::string(textMember(entry, "fname"))};
        if (mac.empty() || part.path.empty() || part.fileName.empty() ||
            !files.emplace(mac, std::move(part)).second)
            return std::nullopt;
    }
    return files.empty() ? std::nullopt : std::optional(std::move(files));
}

/// The certificate of every device, each followed by its key; nothing unless each device has both.
std::optional<Parts> pairs(const JSON &certs, const JSON &pkeys) {
    const auto certificates = filesByMac(certs, "cert_");
    const auto keys = filesByMac(pkeys, "pkey_");
    if (!certificates || !keys || certificates->size() != keys->size())
        return std::nullopt;
    Parts parts;
    for (const auto &[mac, certificate] : *certificates) {
        const auto key = keys->find(mac);
        if (key == keys->end())
            return std::nullopt;
        parts.insert(parts.end(), {certificate, key->second});
    }
    return parts;
}

/// The answer's "code" for the log; -1 where it has none.
int loggedCode(const std::string &body) {
    try {
        return parseJson(body).at("code").get<int>();
    } catch (const std::exception &) {
        return -1;
    }
}

void logFirmwareAnswer(const HttpResponse &answer) {
    qDebug("FW Upload Response -------> Status Code: %d, Code: %d, Body: %s", answer.status,
           loggedCode(answer.body), answer.loggedBody().c_str());
}

} // namespace

CApiClient::Call CApiClient::uploadCall(const char *method, const char *path, const char *transportError) {
    return {.method = method,
            .path = path,
            .transportError = transportError ? transportError : "File upload error: ",
            .logTransportError = [](const Call &call, const std::string &error) {
                qWarning("%s%s", call.transportError, error.c_str());
            }};
}

CApiClient::Call CApiClient::certificateCall(const char *method, const char *path) {
    Call call = uploadCall(method, path);
    call.renewal = "renew token: ";
    return call;
}

std::shared_ptr<Transfer> CApiClient::transferOrOwn() const {
    return m_transfer ? m_transfer : std::make_shared<Transfer>();
}

unsigned CApiClient::upload(const Call &call, const char *szTaskId, JSON parameters,
                            const std::vector<UploadPart> &files) {
    if (!hasSession() || isEmpty(szTaskId))
        return ApiInvalidArgument;
    parameters["id"] = m_strAccount;
    parameters["tid"] = szTaskId;
    const std::shared_ptr<Transfer> transfer = transferOrOwn();
    transfer->begin(0);
    MultipartBody form;
    return send(call, [&](HttpRequest &request) {
        form.addText("text", "data", dumpJson(parameters));
        for (const UploadPart &file : files)
            form.addFile(file);
        form.close();
        transfer->begin(form.length());
        request.transfer = transfer.get();
        request.form = &form;
        request.contentType = form.contentType();
    });
}

unsigned CApiClient::uploadConfigFile(const char *szTaskId, const char *szPath, const char *szFileName,
                                      const JSON &devices) {
    if (isEmpty(szPath) || isEmpty(szFileName) || !devices.is_array())
        return ApiInvalidArgument;
    return upload(uploadCall("uploadConfigFile", "/v1/config_file_upload",
                             "Encountered HTTP request error when CApiClient::uploadConfigFile: "),
                  szTaskId, {{"device_ids", devices}}, image(szPath, szFileName));
}

unsigned CApiClient::uploadFWFile(const char *szTaskId, const char *szPath, const char *szFileName) {
    if (isEmpty(szPath) || isEmpty(szFileName))
        return ApiInvalidArgument;
    // The flag alone may be that of an earlier login whose successor could not be written down.
    const bool isLocal =
        CClientStore::instance().isThisComputer() && CLocalStore::instance().loginInfo().thisComputer;
    Call call = uploadCall("uploadFWFile", isLocal ? "/v1/fwuplex" : "/v1/fwupl");
    call.logAnswer = [](const Call &, const HttpResponse &answer) { logFirmwareAnswer(answer); };
    if (isLocal)
        return upload(call, szTaskId, {{"local", szPath}, {"localn", szFileName}}, {});
    return upload(call, szTaskId, JSON::object(), image(szPath, szFileName));
}

unsigned CApiClient::uploadPackage(const char *szTaskId, const char *szPath, const char *szFileName,
                                   const JSON &devices, bool bSdCard) {
    if (isEmpty(szPath) || isEmpty(szFileName) || !devices.is_array())
        return ApiInvalidArgument;
    return upload(uploadCall("uploadPackage", "/v1/upload_package",
                             "Encountered HTTP request error when CApiClient::uploadPackage: "),
                  szTaskId, {{"device_ids", devices}, {"sd_card", bSdCard}}, image(szPath, szFileName));
}

unsigned CApiClient::createHttpsSelfSignedCerts(const JSON &settings, const JSON &devices) {
    if (!settings.is_object() || !devices.is_array())
        return ApiInvalidArgument;
    JSON body = {{"devices", devices}};
    for (const char *member : selfSignedMembers) {
        if (settings.contains(member))
            body[member] = settings.at(member);
    }
    return postAsAccount({"createHttpsSelfSignedCerts", "/v1/gencert"}, std::move(body));
}

unsigned CApiClient::createHttpsCertsInstall(const char *szTaskId, const JSON &certs) {
    const auto certificates = filesByMac(certs, "cert_");
    if (!certificates)
        return ApiInvalidArgument;
    Parts parts;
    for (const auto &[mac, certificate] : *certificates)
        parts.push_back(certificate);
    return upload(certificateCall("createHttpsCertsInstall", "/v1/sslcertinst"), szTaskId, JSON::object(),
                  parts);
}

unsigned CApiClient::createHttpsCertsPKeys(const char *szTaskId, const JSON &certs, const JSON &pkeys) {
    const std::optional<Parts> parts = pairs(certs, pkeys);
    if (!parts)
        return ApiInvalidArgument;
    return upload(certificateCall("createHttpsCertsPKeys", "/v1/sslcertpkeys"), szTaskId, JSON::object(),
                  *parts);
}

unsigned CApiClient::uploadPEAPCA(const char *szTaskId, const char *szPath, const char *szFileName) {
    if (isEmpty(szPath) || isEmpty(szFileName))
        return ApiInvalidArgument;
    return upload(certificateCall("uploadPEAPCA", "/v1/ie_peap"), szTaskId, JSON::object(),
                  {caPart(szPath, szFileName)});
}

unsigned CApiClient::uploadTLSCA(const char *szTaskId, const char *szPath, const char *szFileName,
                                 const JSON &certs, const JSON &pkeys) {
    std::optional<Parts> parts = pairs(certs, pkeys);
    if (isEmpty(szPath) || isEmpty(szFileName) || !parts)
        return ApiInvalidArgument;
    parts->insert(parts->begin(), caPart(szPath, szFileName));
    return upload(certificateCall("uploadTLSCA", "/v1/ie_tls"), szTaskId, JSON::object(), *parts);
}

unsigned CApiClient::exportFile(const char *szTaskId, const char *szTarget) {
    if (!hasSession() || isEmpty(szTaskId) || isEmpty(szTarget))
        return ApiInvalidArgument;
    const std::shared_ptr<Transfer> transfer = transferOrOwn();
    transfer->begin(0);
    DownloadTarget target(szTarget);
    const JSON body = {{"id", m_strAccount}, {"tid", szTaskId}};
    const auto fill = [&](HttpRequest &request) {
        // Before anything is asked for: a file that cannot be kept need not be sent.
        if (!target.open())
            throw TransferError(TransferFailure::TargetNotWritten, "the target cannot be written",
                                target.name());
        request.contentType = "application/x-www-form-urlencoded";
        request.body = dumpJson(body);
        request.transfer = transfer.get();
        request.target = &target;
    };
    const unsigned result = send({"exportFile", "/v1/export/file", Payload::File}, fill);
    if (result != ApiOk || target.finish())
        return result;
    transfer->fail(TransferFailure::TargetNotWritten, target.name());
    return ApiTargetNotWritten;
}
