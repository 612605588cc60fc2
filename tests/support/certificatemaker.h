#pragma once

#include <QByteArray>

#include <openssl/evp.h>
#include <openssl/pem.h>
#include <openssl/x509v3.h>

#include <memory>

/// Certificates and private keys for tests of what reads them.
namespace CertificateMaker {

template <auto Free>
struct Freed {
    template <typename T>
    void operator()(T *object) const {
        Free(object);
    }
};
using Key = std::unique_ptr<EVP_PKEY, Freed<EVP_PKEY_free>>;
using Certificate = std::unique_ptr<X509, Freed<X509_free>>;
using Bio = std::unique_ptr<BIO, Freed<BIO_free_all>>;

inline Key makeKey() {
    return Key(EVP_PKEY_Q_keygen(nullptr, nullptr, "EC", "P-256"));
}

/// Signed with its own key; the days count from now.
inline Certificate makeCertificate(EVP_PKEY *key, const char *name, int fromDays = -1, int untilDays = 365,
                                   bool isAuthority = false) {
    constexpr long day = 86400;
    Certificate made(X509_new());
    X509_set_version(made.get(), X509_VERSION_3);
    X509_gmtime_adj(X509_getm_notBefore(made.get()), fromDays * day);
    X509_gmtime_adj(X509_getm_notAfter(made.get()), untilDays * day);
    X509_NAME *subject = X509_get_subject_name(made.get());
    X509_NAME_add_entry_by_txt(subject, "CN", MBSTRING_UTF8, reinterpret_cast<const unsigned char *>(name),
                               -1, -1, 0);
    X509_set_issuer_name(made.get(), subject);
    X509_set_pubkey(made.get(), key);
    if (isAuthority) {
        const std::unique_ptr<X509_EXTENSION, Freed<X509_EXTENSION_free>> extension(
            X509V3_EXT_conf_nid(nullptr, nullptr, NID_basic_constraints, "critical,CA:TRUE"));
        X509_add_ext(made.get(), extension.get(), -1);
    }
    X509_sign(made.get(), key, EVP_sha256());
    return made;
}

/// What a writing function of the library puts out.
template <typename Write>
QByteArray written(Write write) {
    const Bio out(BIO_new(BIO_s_mem()));
    if (write(out.get()) != 1)
        qFatal("a test's certificate or key cannot be written");
    char *text = nullptr;
    const long length = BIO_get_mem_data(out.get(), &text);
    return QByteArray(text, length);
}

inline QByteArray pem(const Certificate &certificate) {
    return written([&](BIO *out) { return PEM_write_bio_X509(out, certificate.get()); });
}
inline QByteArray der(const Certificate &certificate) {
    return written([&](BIO *out) { return i2d_X509_bio(out, certificate.get()); });
}
/// Under a pass phrase unless that is null.
inline QByteArray pem(const Key &key, const char *passPhrase = nullptr) {
    return written([&](BIO *out) {
        return PEM_write_bio_PKCS8PrivateKey(out, key.get(), passPhrase ? EVP_aes_128_cbc() : nullptr,
                                             passPhrase, passPhrase ? int(qstrlen(passPhrase)) : 0, nullptr,
                                             nullptr);
    });
}
inline QByteArray der(const Key &key, const char *passPhrase = nullptr) {
    return written([&](BIO *out) {
        return i2d_PKCS8PrivateKey_bio(out, key.get(), passPhrase ? EVP_aes_128_cbc() : nullptr, passPhrase,
                                       passPhrase ? int(qstrlen(passPhrase)) : 0, nullptr, nullptr);
    });
}

} // namespace CertificateMaker
