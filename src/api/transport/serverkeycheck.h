#pragma once

#include <openssl/types.h>

#include <string>

/// Looks at a server's public key in the handshake, before anything of a request is sent. No authority is
/// asked: a key is the right one when it is the one that is expected.
class ServerKeyCheck {
public:
    /// expected: fingerprint, or empty to take any key.
    explicit ServerKeyCheck(std::string expected) : m_expected(std::move(expected)) {}

    /// The context may call back as long as it lives; the check of a later request takes the place of an
    /// earlier one's.
    void watch(SSL_CTX *context);

    /// Fingerprint of the key that the server has shown: SHA-256 of its SubjectPublicKeyInfo (DER) in lower
    /// case hex; empty before the handshake.
    const std::string &presented() const { return m_presented; }
    /// The server has shown another key than the expected one.
    bool hasRefused() const { return m_refused; }

private:
    static int onCertificate(X509_STORE_CTX *chain, void *check);
    static void onProgress(const SSL *session, int where, int result);
    bool accepts(const X509 *certificate);

    std::string m_expected;
    std::string m_presented;
    bool m_refused = false;
};
