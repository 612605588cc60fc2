#include "certificate.h"

#include <openssl/rand.h>

#include <stdexcept>
#include <string>

namespace emulator {

namespace {

constexpr long validSeconds = 10L * 365 * 24 * 3600;

void require(bool done) {
    if (!done) {
        throw std::runtime_error("the server's certificate cannot be made");
    }
}

void nameIt(X509 *certificate) {
    X509_NAME *name = X509_get_subject_name(certificate);
    const std::string common = "Norvell Device Manager Service";
    require(X509_NAME_add_entry_by_txt(name, "CN", MBSTRING_UTF8,
                                       reinterpret_cast<const unsigned char *>(common.data()),
                                       static_cast<int>(common.size()), -1, 0) == 1);
    require(X509_set_issuer_name(certificate, name) == 1);
}

} // namespace

ServerIdentity makeServerIdentity() {
    ServerIdentity identity;
    identity.key.reset(EVP_PKEY_Q_keygen(nullptr, nullptr, "EC", "P-256"));
    identity.certificate.reset(X509_new());
    X509 *certificate = identity.certificate.get();
    require(identity.key && certificate);
    // A browser remembers the serial of a certificate, so two runs must not share one.
    int serial = 0;
    require(RAND_bytes(reinterpret_cast<unsigned char *>(&serial), sizeof serial) == 1);
    require(X509_set_version(certificate, X509_VERSION_3) == 1);
    require(ASN1_INTEGER_set(X509_get_serialNumber(certificate), serial & 0x7fffffff) == 1);
    require(X509_gmtime_adj(X509_getm_notBefore(certificate), -3600) != nullptr);
    require(X509_gmtime_adj(X509_getm_notAfter(certificate), validSeconds) != nullptr);
    require(X509_set_pubkey(certificate, identity.key.get()) == 1);
    nameIt(certificate);
    require(X509_sign(certificate, identity.key.get(), EVP_sha256()) > 0);
    return identity;
}

} // namespace emulator
