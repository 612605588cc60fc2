#include "api/transport/clientidentity.h"

#include "platform/files/privatefiles.h"

#include <openssl/bio.h>
#include <openssl/pem.h>
#include <openssl/x509.h>

namespace {

constexpr const char *certificateFile = "./client.cer";
constexpr const char *keyFile = "./client.key";
constexpr qint64 sizeLimit = 64 << 10;

struct FreeBio {
    void operator()(BIO *bio) const { BIO_free_all(bio); }
};

/// The library would ask on the terminal otherwise, and the request would wait for somebody to answer there.
int refusePassPhrase(char *, int, int, void *) {
    return -1;
}

template <typename Reader>
auto readFrom(const char *file, Reader reader) {
    const QByteArray text = PrivateFiles::readOwn(QString::fromUtf8(file), sizeLimit).value_or(QByteArray());
    const std::unique_ptr<BIO, FreeBio> bio(BIO_new_mem_buf(text.constData(), static_cast<int>(text.size())));
    return bio ? reader(bio.get(), nullptr, &refusePassPhrase, nullptr) : nullptr;
}

} // namespace

ClientIdentity::ClientIdentity()
    : m_certificate(readFrom(certificateFile, &PEM_read_bio_X509)),
      m_key(m_certificate ? readFrom(keyFile, &PEM_read_bio_PrivateKey) : nullptr) {}

void ClientIdentity::Free::operator()(X509 *certificate) const {
    X509_free(certificate);
}

void ClientIdentity::Free::operator()(EVP_PKEY *key) const {
    EVP_PKEY_free(key);
}
