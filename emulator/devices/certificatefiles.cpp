#include "devices/certificatefiles.h"

#include "http/response.h"
#include "simulation/clock.h"
#include "tables/credentials.h"
#include "tables/devicetable.h"
#include "tables/records.h"

#include <openssl/bio.h>
#include <openssl/err.h>
#include <openssl/pem.h>

namespace emulator {

namespace {

constexpr auto unreadable = "pTaskInvalidFileOrPublicKey";
constexpr auto mismatching = "pTaskMismatchingPrivateKeyAndCertificate";
constexpr auto notInstalled = "pTaskCertificateNotInstalled";

struct FreeBio {
    void operator()(BIO *bio) const { BIO_free_all(bio); }
};
using Bio = std::unique_ptr<BIO, FreeBio>;
using Certificate = std::unique_ptr<X509, FreeX509>;
using Key = std::unique_ptr<EVP_PKEY, FreeKey>;

Bio readerOf(const std::string &bytes) {
    return Bio(BIO_new_mem_buf(bytes.data(), static_cast<int>(bytes.size())));
}

/// The library would ask on the terminal otherwise.
int givePassPhrase(char *buffer, int size, int, void *phrase) {
    const auto &text = *static_cast<const std::string *>(phrase);
    if (text.empty() || text.size() > static_cast<std::size_t>(size))
        return -1;
    text.copy(buffer, text.size());
    return static_cast<int>(text.size());
}

bool isTrue(const Json &record, const char *name) {
    return record.value(name, Json()) == true;
}

DeviceWork workOf(const Device &device, std::string failure) {
    DeviceWork work;
    work.id = device.id;
    work.failure = std::move(failure);
    return work;
}

/// The pass phrase or password that the task holds for a device.
std::string passOf(const Json &parameters) {
    if (optionalText(parameters, "identity").empty())
        throw Refusal(Code::Malformed, "a device of the task has no \"identity\"");
    const std::string cipher = optionalText(parameters, "pass");
    const auto plain = cipher.empty() ? std::optional(std::string()) : plainPassword(cipher);
    if (!plain)
        throw Refusal(Code::Malformed, "\"pass\" of a device of the task does not decipher");
    return *plain;
}

void secure(DeviceWork &work, const X509 &certificate) {
    work.changes = {{"ieee8021x_enable", true}, {"d_8021x_expires", expiryOf(certificate)}};
}

} // namespace

Certificate certificateOf(const std::string &bytes) {
    const std::string none;
    const Bio reader = readerOf(bytes);
    Certificate certificate(
        PEM_read_bio_X509(reader.get(), nullptr, &givePassPhrase, const_cast<std::string *>(&none)));
    if (!certificate) {
        const auto *start = reinterpret_cast<const unsigned char *>(bytes.data());
        certificate.reset(d2i_X509(nullptr, &start, static_cast<long>(bytes.size())));
    }
    ERR_clear_error();
    return certificate;
}

Key privateKeyOf(const std::string &bytes, const std::string &passPhrase) {
    const Bio reader = readerOf(bytes);
    Key key(PEM_read_bio_PrivateKey(reader.get(), nullptr, &givePassPhrase,
                                    const_cast<std::string *>(&passPhrase)));
    if (!key) {
        const auto *start = reinterpret_cast<const unsigned char *>(bytes.data());
        key.reset(d2i_AutoPrivateKey(nullptr, &start, static_cast<long>(bytes.size())));
    }
    ERR_clear_error();
    return key;
}

std::string subjectOf(const X509 &certificate) {
    const Bio writer(BIO_new(BIO_s_mem()));
    X509_NAME_print_ex(writer.get(), X509_get_subject_name(&certificate), 0,
                       XN_FLAG_RFC2253 & ~static_cast<unsigned long>(ASN1_STRFLGS_ESC_MSB));
    char *text = nullptr;
    const long length = BIO_get_mem_data(writer.get(), &text);
    return length > 0 ? std::string(text, static_cast<std::size_t>(length)) : std::string();
}

std::int64_t expiryOf(const X509 &certificate) {
    std::tm parts{};
    if (ASN1_TIME_to_tm(X509_get0_notAfter(&certificate), &parts) != 1)
        return 0;
    return msOfUtc(parts);
}

CertificateFiles::CertificateFiles(std::span<const UploadedFile> files) {
    for (const UploadedFile &file : files) {
        const std::string mac = macKeyOf(file.part.size() > 5 ? file.part.substr(5) : std::string());
        if (file.part == "ca_")
            m_authority = &file;
        else if (file.part.starts_with("cert_") && !mac.empty())
            m_certificates[mac] = &file;
        else if (file.part.starts_with("pkey_") && !mac.empty())
            m_keys[mac] = &file;
        else
            throw Refusal(Code::Malformed, "a part of the form belongs to no device");
    }
}

Certificate CertificateFiles::certificateFor(const Device &device, std::string &failure) const {
    const auto file = m_certificates.find(device.macKey);
    if (file == m_certificates.end()) {
        failure = notInstalled;
        return nullptr;
    }
    Certificate certificate = certificateOf(file->second->head);
    failure = certificate ? "" : unreadable;
    return certificate;
}

Certificate CertificateFiles::keyedCertificateFor(const Device &device, const std::string &passPhrase,
                                                  std::string &failure) const {
    Certificate certificate = certificateFor(device, failure);
    const auto file = m_keys.find(device.macKey);
    if (!certificate || file == m_keys.end()) {
        failure = certificate ? notInstalled : failure;
        return nullptr;
    }
    const Key key = privateKeyOf(file->second->head, passPhrase);
    const bool fits = key && X509_check_private_key(certificate.get(), key.get()) == 1;
    ERR_clear_error();
    failure = !key ? unreadable : !fits ? mismatching : "";
    return fits ? std::move(certificate) : nullptr;
}

DeviceWork CertificateFiles::install(const Device &device, const Json &parameters) const {
    std::string failure;
    const Certificate certificate = certificateFor(device, failure);
    const Json record = Json::parse(device.body);
    // A certificate is of no use to a device that has no key for it.
    const bool hasKey =
        isTrue(record, "d_has_matching_private_key") || isTrue(record, "d_has_matching_cert_request");
    DeviceWork work = workOf(device, certificate && !hasKey ? notInstalled : failure);
    if (certificate) {
        work.changes = httpsChanges(subjectOf(*certificate), expiryOf(*certificate),
                                    parameters.value("https_port", Json()));
    }
    return work;
}

DeviceWork CertificateFiles::installWithKey(const Device &device, const Json &parameters) const {
    std::string failure;
    const Certificate certificate = keyedCertificateFor(device, {}, failure);
    DeviceWork work = workOf(device, failure);
    if (certificate) {
        work.changes = httpsChanges(subjectOf(*certificate), expiryOf(*certificate),
                                    parameters.value("https_port", Json()));
    }
    return work;
}

DeviceWork CertificateFiles::portSecurity(const Device &device, const Json &parameters) const {
    passOf(parameters);
    const Certificate authority = certificateOf(m_authority->head);
    DeviceWork work = workOf(device, authority ? "" : unreadable);
    if (authority)
        secure(work, *authority);
    return work;
}

DeviceWork CertificateFiles::portSecurityWithKey(const Device &device, const Json &parameters) const {
    DeviceWork work = portSecurity(device, parameters);
    if (work.failure.empty()) {
        const Certificate certificate = keyedCertificateFor(device, passOf(parameters), work.failure);
        if (certificate)
            secure(work, *certificate);
    }
    return work;
}

Json httpsChanges(const std::string &subject, std::int64_t expiresAt, const Json &port) {
    Json changes = {{"https_enable", true},
                    {"d_has_matching_cert", true},
                    {"d_has_matching_private_key", true},
                    {"d_has_matching_cert_request", false},
                    {"d_cert_subject", subject},
                    {"d_cert_expires", expiresAt}};
    if (port.is_number_integer() && port >= 1 && port <= 65535)
        changes["d_https"] = port;
    return changes;
}

} // namespace emulator
