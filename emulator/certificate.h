#pragma once

#include <openssl/evp.h>
#include <openssl/x509.h>

#include <memory>

namespace emulator {

struct FreeKey {
    void operator()(EVP_PKEY *key) const { EVP_PKEY_free(key); }
};
struct FreeX509 {
    void operator()(X509 *certificate) const { X509_free(certificate); }
};

/// A key pair and a certificate for it that live in memory only.
struct ServerIdentity {
    std::unique_ptr<EVP_PKEY, FreeKey> key;
    std::unique_ptr<X509, FreeX509> certificate;
};

/// Makes a fresh self-signed identity. Throws std::runtime_error when OpenSSL refuses.
ServerIdentity makeServerIdentity();

} // namespace emulator
