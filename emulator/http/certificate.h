#pragma once

#include <openssl/evp.h>
#include <openssl/x509.h>

#include <filesystem>
#include <memory>

namespace emulator {

struct FreeKey {
    void operator()(EVP_PKEY *key) const { EVP_PKEY_free(key); }
};
struct FreeX509 {
    void operator()(X509 *certificate) const { X509_free(certificate); }
};

/// A key pair and a certificate for it.
struct ServerIdentity {
    std::unique_ptr<EVP_PKEY, FreeKey> key;
    std::unique_ptr<X509, FreeX509> certificate;
};

/// The identity that an earlier run has left in the file (PEM, key and certificate), so that clients know the
/// server again; where there is none that can be used, a fresh self-signed one, which is written there.
/// Throws std::runtime_error when that fails.
ServerIdentity loadServerIdentity(const std::filesystem::path &path);

} // namespace emulator
