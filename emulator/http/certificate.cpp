#include "http/certificate.h"

#include "platform.h"

#include <openssl/err.h>
#include <openssl/pem.h>
#include <openssl/rand.h>

#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>

namespace emulator {

namespace {

struct FreeBio {
    void operator()(BIO *bio) const { BIO_free(bio); }
};
using Bio = std::unique_ptr<BIO, FreeBio>;

constexpr long validSeconds = 10L * 365 * 24 * 3600;

void require(bool done) {
    if (!done)
        throw std::runtime_error("the server's certificate cannot be made");
}

void nameIt(X509 *certificate) {
    X509_NAME *name = X509_get_subject_name(certificate);
    const std::string common = "Norvell Device Manager Service";
    require(X509_NAME_add_entry_by_txt(name, "CN", MBSTRING_UTF8,
                                       reinterpret_cast<const unsigned char *>(common.data()),
                                       static_cast<int>(common.size()), -1, 0) == 1);
    require(X509_set_issuer_name(certificate, name) == 1);
}

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

ServerIdentity readServerIdentity(const std::filesystem::path &path) {
    std::ifstream file(path, std::ios::binary);
    const std::string text((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    ServerIdentity identity;
    const Bio keyReader(BIO_new_mem_buf(text.data(), static_cast<int>(text.size())));
    const Bio certificateReader(BIO_new_mem_buf(text.data(), static_cast<int>(text.size())));
    require(keyReader && certificateReader);
    identity.key.reset(PEM_read_bio_PrivateKey(keyReader.get(), nullptr, nullptr, nullptr));
    identity.certificate.reset(PEM_read_bio_X509(certificateReader.get(), nullptr, nullptr, nullptr));
    return identity;
}

bool isUsable(const ServerIdentity &identity) {
    const X509 *certificate = identity.certificate.get();
    return identity.key && certificate && X509_check_private_key(certificate, identity.key.get()) == 1 &&
           X509_cmp_current_time(X509_get0_notAfter(certificate)) > 0;
}

void writeServerIdentity(const ServerIdentity &identity, const std::filesystem::path &path) {
    const Bio writer(BIO_new(BIO_s_mem()));
    require(writer && PEM_write_bio_PrivateKey(writer.get(), identity.key.get(), nullptr, nullptr, 0, nullptr,
                                               nullptr) == 1);
    require(PEM_write_bio_X509(writer.get(), identity.certificate.get()) == 1);
    char *text = nullptr;
    const long size = BIO_get_mem_data(writer.get(), &text);
    const std::filesystem::path fresh = std::filesystem::path(path) += ".new";
    platform::writePrivateFile(fresh, std::string(text, static_cast<std::size_t>(size)));
    std::filesystem::rename(fresh, path);
}

} // namespace

ServerIdentity loadServerIdentity(const std::filesystem::path &path) {
    ServerIdentity identity = readServerIdentity(path);
    if (!isUsable(identity)) {
        ERR_clear_error();
        identity = makeServerIdentity();
        writeServerIdentity(identity, path);
    }
    return identity;
}

} // namespace emulator
