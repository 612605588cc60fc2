#pragma once

#include <openssl/evp.h>

#include <memory>

class QByteArray;

/// Opens private keys of files, which may come from anybody: what would hold the program for minutes is
/// looked for before the library computes anything.
namespace PrivateKeys {

struct Free {
    void operator()(EVP_PKEY *key) const { EVP_PKEY_free(key); }
};
using Key = std::unique_ptr<EVP_PKEY, Free>;

struct Opened {
    Key key;                  ///< null where it could not be opened
    bool isExcessive = false; ///< it was not even tried: larger or slower than any key in use
};

/// The longest key that is looked at, in bytes.
inline constexpr long maxKey = 64 << 10;

/// A key in DER form: PKCS#8, or one of the older forms of RSA, EC and DSA.
Opened open(const unsigned char *der, long length);
/// A key under a pass phrase, in DER form (PKCS#8).
Opened openSealed(const unsigned char *der, long length, const QByteArray &passPhrase);

} // namespace PrivateKeys
