#include "devices/certificatefiles.h"
#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tasks/taskwork.h"

#include <charconv>

namespace emulator {

namespace {

constexpr std::int64_t dayMs = 86400000;
constexpr std::int64_t maxValidityDays = 36500;

using FileWork = DeviceWork (CertificateFiles::*)(const Device &, const Json &) const;

Response takeFiles(Service &service, const Call &call, const char *type, FileWork workOf,
                   bool needsAuthority) {
    const CertificateFiles files(call.files);
    if (call.files.empty() || files.hasAuthority() != needsAuthority)
        throw Refusal(Code::Malformed, "the form lacks a file or has one too many");
    UploadOrder order;
    order.account = call.session.account;
    order.taskId = filledTextMember(call.body, "tid");
    order.type = type;
    order.files = call.files;
    startUpload(service, order, [&](const Device &device, const Json &parameters) {
        return (files.*workOf)(device, parameters);
    });
    return {};
}

Response installCertificates(Service &service, const Call &call) {
    return takeFiles(service, call, "deviceHttpsCertInstall", &CertificateFiles::install, false);
}

Response installWithKeys(Service &service, const Call &call) {
    return takeFiles(service, call, "deviceHttpsCertsAndPKeys", &CertificateFiles::installWithKey, false);
}

Response securePorts(Service &service, const Call &call) {
    return takeFiles(service, call, "deviceIEEE_EAP_PEAP", &CertificateFiles::portSecurity, true);
}

Response securePortsWithKeys(Service &service, const Call &call) {
    return takeFiles(service, call, "deviceIEEE_EAP_TLS", &CertificateFiles::portSecurityWithKey, true);
}

/// A number that comes as one or as a text.
std::int64_t looseNumber(const Json &body, const char *name, std::int64_t max) {
    const Json &value = member(body, name);
    const std::string text = value.is_string() ? value.get<std::string>() : jsonText(value);
    std::int64_t number = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (error != std::errc() || end != text.data() + text.size() || number < 1 || number > max)
        throw Refusal(Code::Malformed, std::string("\"") + name + "\" is no such number");
    return number;
}

/// The subject without its common name, as a certificate's text has it.
std::string ownerText(const Json &body) {
    const std::string country = optionalText(body, "country");
    if (!country.empty() && country.size() != 2)
        throw Refusal(Code::Malformed, "\"country\" has two letters");
    struct Part {
        const char *member;
        const char *name;
    };
    std::string text;
    for (const auto &[name, key] :
         {Part{"org_unit", "OU"}, Part{"org", "O"}, Part{"locality", "L"}, Part{"state", "ST"}}) {
        const std::string value = optionalText(body, name);
        text += value.empty() ? value : std::string(",") + key + '=' + value;
    }
    return country.empty() ? text : text + ",C=" + country;
}

Response generateCertificates(Service &service, const Call &call) {
    const Json port = looseNumber(call.body, "https_port", 65535);
    const std::int64_t expiresAt = nowMs() + looseNumber(call.body, "validity", maxValidityDays) * dayMs;
    const std::string owner = ownerText(call.body);
    order(service, targetsOf(call.body), "deviceGenSelfSignedCert", [&](const Device &device) {
        DeviceWork work;
        work.changes = httpsChanges("CN=" + device.ip + owner, expiresAt, port);
        return work;
    });
    return {};
}

} // namespace

Endpoints certificateEndpoints() {
    return {
        {"POST", "/v1/sslcertinst", Role::Writer, &installCertificates, Body::Form},
        {"POST", "/v1/sslcertpkeys", Role::Writer, &installWithKeys, Body::Form},
        {"POST", "/v1/ie_peap", Role::Writer, &securePorts, Body::Form},
        {"POST", "/v1/ie_tls", Role::Writer, &securePortsWithKeys, Body::Form},
        {"POST", "/v1/gencert", Role::Writer, &generateCertificates},
    };
}

} // namespace emulator
