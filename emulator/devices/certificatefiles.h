#pragma once

#include "devices/devicework.h"
#include "http/certificate.h"
#include "http/uploadedfile.h"

#include <cstdint>
#include <memory>
#include <span>
#include <string>
#include <unordered_map>

namespace emulator {

struct Device;

/// A certificate in PEM or DER form; null for a text that is none.
std::unique_ptr<X509, FreeX509> certificateOf(const std::string &bytes);
/// A private key in PEM or DER form, perhaps under a pass phrase; null where it cannot be read.
std::unique_ptr<EVP_PKEY, FreeKey> privateKeyOf(const std::string &bytes, const std::string &passPhrase);

std::string subjectOf(const X509 &certificate);
std::int64_t expiryOf(const X509 &certificate); ///< Unix ms

/// The certificates and keys of an upload, which name their devices by the MACs in the names of their parts.
/// Reading them takes its time; not to be done under the model's lock.
class CertificateFiles {
public:
    explicit CertificateFiles(std::span<const UploadedFile> files);

    /// True when a certificate of an authority is there.
    bool hasAuthority() const { return m_authority != nullptr; }

    /// What the files mean for a device, whose parameters the task holds.
    DeviceWork install(const Device &device, const Json &parameters) const;
    DeviceWork installWithKey(const Device &device, const Json &parameters) const;
    DeviceWork portSecurity(const Device &device, const Json &parameters) const;
    DeviceWork portSecurityWithKey(const Device &device, const Json &parameters) const;

private:
    using Files = std::unordered_map<std::string, const UploadedFile *>;

    /// The certificate of a device; where there is no usable one, the failure says why.
    std::unique_ptr<X509, FreeX509> certificateFor(const Device &device, std::string &failure) const;
    /// The same, for a certificate that a key must come with.
    std::unique_ptr<X509, FreeX509> keyedCertificateFor(const Device &device, const std::string &passPhrase,
                                                        std::string &failure) const;

    const UploadedFile *m_authority = nullptr;
    Files m_certificates; ///< by the MACs of their devices
    Files m_keys;
};

/// The members of the record of a device that speaks HTTPS with a certificate.
Json httpsChanges(const std::string &subject, std::int64_t expiresAt, const Json &port);

} // namespace emulator
