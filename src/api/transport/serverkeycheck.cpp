#include "api/transport/serverkeycheck.h"

#include <openssl/err.h>
#include <openssl/evp.h>
#include <openssl/ssl.h>
#include <openssl/x509.h>

#include <memory>

namespace {

struct FreeBytes {
    void operator()(unsigned char *bytes) const { OPENSSL_free(bytes); }
};

std::string hexOf(const unsigned char *bytes, std::size_t length) {
    constexpr char digits[] = "0123456789abcdef";
    std::string text;
    for (std::size_t i = 0; i < length; ++i) {
        text += digits[bytes[i] >> 4];
        text += digits[bytes[i] & 15];
    }
    return text;
}

/// Empty when the certificate has no key that can be written.
std::string fingerprintOf(const X509 *certificate) {
    unsigned char *bytes = nullptr;
    const int length = certificate ? i2d_X509_PUBKEY(X509_get_X509_PUBKEY(certificate), &bytes) : 0;
    const std::unique_ptr<unsigned char, FreeBytes> key(bytes);
    unsigned char digest[EVP_MAX_MD_SIZE];
    std::size_t digestLength = 0;
    if (length <= 0 || EVP_Q_digest(nullptr, "SHA256", nullptr, key.get(), static_cast<std::size_t>(length),
                                    digest, &digestLength) != 1)
        return {};
    return hexOf(digest, digestLength);
}

/// Where a context keeps its check for the callback that is given none.
int checkIndex() {
    static const int index = SSL_CTX_get_ex_new_index(0, nullptr, nullptr, nullptr, nullptr);
    return index;
}

} // namespace

void ServerKeyCheck::watch(SSL_CTX *context) {
    SSL_CTX_set_ex_data(context, checkIndex(), this);
    // In place of looking for an authority; a refusal ends the handshake with an alert.
    SSL_CTX_set_cert_verify_callback(context, &ServerKeyCheck::onCertificate, this);
    SSL_CTX_set_verify(context, SSL_VERIFY_PEER, nullptr);
    SSL_CTX_set_info_callback(context, &ServerKeyCheck::onProgress);
}

int ServerKeyCheck::onCertificate(X509_STORE_CTX *chain, void *check) {
    const bool accepted = static_cast<ServerKeyCheck *>(check)->accepts(X509_STORE_CTX_get0_cert(chain));
    if (!accepted)
        X509_STORE_CTX_set_error(chain, X509_V_ERR_APPLICATION_VERIFICATION);
    return accepted ? 1 : 0;
}

/// A resumed session brings no certificate, so its key is looked at when the handshake is done, in what the
/// session has kept of the first one.
void ServerKeyCheck::onProgress(const SSL *session, int where, int) {
    if (!(where & SSL_CB_HANDSHAKE_DONE))
        return;
    auto *check = static_cast<ServerKeyCheck *>(SSL_CTX_get_ex_data(SSL_get_SSL_CTX(session), checkIndex()));
    // Nothing can be written to a connection that is shut down.
    if (check && !check->accepts(SSL_get0_peer_certificate(session)))
        SSL_set_shutdown(const_cast<SSL *>(session), SSL_SENT_SHUTDOWN | SSL_RECEIVED_SHUTDOWN);
}

bool ServerKeyCheck::accepts(const X509 *certificate) {
    try {
        m_presented = fingerprintOf(certificate);
    } catch (...) {
        m_presented.clear();
    }
    // A server without a key that can be named is nobody's.
    m_refused = m_presented.empty() || (!m_expected.empty() && m_presented != m_expected);
    return !m_refused;
}
