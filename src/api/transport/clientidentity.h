#pragma once

#include <openssl/types.h>

#include <memory>

/// The certificate and the private key with which the client shows itself to a service: "./client.cer" and
/// "./client.key", in PEM form, plain files of this user of 64 KiB at most. Neither is there unless both can
/// be read; a key behind a pass phrase cannot.
class ClientIdentity {
public:
    ClientIdentity();

    bool isThere() const { return m_certificate && m_key; }
    X509 *certificate() const { return m_certificate.get(); }
    EVP_PKEY *key() const { return m_key.get(); }

private:
    struct Free {
        void operator()(X509 *certificate) const;
        void operator()(EVP_PKEY *key) const;
    };

    std::unique_ptr<X509, Free> m_certificate;
    std::unique_ptr<EVP_PKEY, Free> m_key;
};
