#include "devices/operations/certificates/privatekeys.h"

#include <QByteArray>

#include <openssl/pkcs12.h>
#include <openssl/x509.h>

#include <algorithm>
#include <cstdint>

namespace PrivateKeys {

namespace {

/// All but RSA keys are short; the library computes the public half of some, for hours where they are long.
constexpr long maxOther = 4 << 10;
/// About a second of work; common tools use a few thousand to a million.
constexpr std::uint64_t maxRounds = 2'000'000;
/// The product of scrypt's three parameters, about a second of work as well.
constexpr std::uint64_t maxScryptWork = 1 << 22;

template <auto Function>
struct Freed {
    template <typename T>
    void operator()(T *object) const {
        Function(object);
    }
};
using Sealed = std::unique_ptr<X509_SIG, Freed<X509_SIG_free>>;
using Info = std::unique_ptr<PKCS8_PRIV_KEY_INFO, Freed<PKCS8_PRIV_KEY_INFO_free>>;
using Pbe = std::unique_ptr<PBEPARAM, Freed<PBEPARAM_free>>;
using Pbe2 = std::unique_ptr<PBE2PARAM, Freed<PBE2PARAM_free>>;
using Pbkdf2 = std::unique_ptr<PBKDF2PARAM, Freed<PBKDF2PARAM_free>>;
using Scrypt = std::unique_ptr<SCRYPT_PARAMS, Freed<SCRYPT_PARAMS_free>>;

bool isAtMost(const ASN1_INTEGER *number, std::uint64_t limit) {
    std::uint64_t value = 0;
    return number && ASN1_INTEGER_get_uint64(&value, number) == 1 && value <= limit;
}

/// The value inside of an algorithm's parameters; null where it is of another form.
template <typename Pointer>
Pointer unpacked(const ASN1_ITEM *form, const X509_ALGOR *algorithm) {
    return Pointer(
        static_cast<typename Pointer::element_type *>(ASN1_TYPE_unpack_sequence(form, algorithm->parameter)));
}

int kindOf(const X509_ALGOR *algorithm) {
    return OBJ_obj2nid(algorithm->algorithm);
}

bool isBearable(const SCRYPT_PARAMS &scrypt) {
    std::uint64_t work = 1;
    for (const ASN1_INTEGER *number :
         {scrypt.costParameter, scrypt.blockSize, scrypt.parallelizationParameter}) {
        // Each alone first: their product may not fit any number.
        if (!isAtMost(number, maxScryptWork))
            return false;
        std::uint64_t value = 0;
        ASN1_INTEGER_get_uint64(&value, number);
        work *= value;
        if (work > maxScryptWork)
            return false;
    }
    return true;
}

/// True where making the key out of a pass phrase takes a second or so at most.
bool isBearable(const X509_ALGOR *scheme) {
    if (kindOf(scheme) != NID_pbes2) {
        const auto rounds = unpacked<Pbe>(ASN1_ITEM_rptr(PBEPARAM), scheme);
        return rounds && isAtMost(rounds->iter, maxRounds);
    }
    const auto parts = unpacked<Pbe2>(ASN1_ITEM_rptr(PBE2PARAM), scheme);
    if (!parts)
        return false;
    if (kindOf(parts->keyfunc) == NID_id_scrypt) {
        const auto scrypt = unpacked<Scrypt>(ASN1_ITEM_rptr(SCRYPT_PARAMS), parts->keyfunc);
        return scrypt && isBearable(*scrypt);
    }
    const auto rounds = unpacked<Pbkdf2>(ASN1_ITEM_rptr(PBKDF2PARAM), parts->keyfunc);
    return rounds && isAtMost(rounds->iter, maxRounds);
}

bool isRsa(int kind) {
    return kind == NID_rsaEncryption || kind == NID_rsassaPss;
}

bool isKnown(int kind) {
    return isRsa(kind) || kind == NID_X9_62_id_ecPublicKey || kind == NID_dsa || kind == NID_ED25519 ||
           kind == NID_ED448;
}

Opened opened(const PKCS8_PRIV_KEY_INFO *info, long length) {
    const ASN1_OBJECT *algorithm = nullptr;
    PKCS8_pkey_get0(&algorithm, nullptr, nullptr, nullptr, info);
    const int kind = OBJ_obj2nid(algorithm);
    if (!isKnown(kind))
        return {};
    if (!isRsa(kind) && length > maxOther)
        return {{}, true};
    return {Key(EVP_PKCS82PKEY(info)), false};
}

} // namespace

Opened open(const unsigned char *der, long length) {
    if (length > maxKey)
        return {{}, true};
    const unsigned char *at = der;
    if (const Info info(d2i_PKCS8_PRIV_KEY_INFO(nullptr, &at, length)); info)
        return opened(info.get(), length);
    at = der;
    if (Key rsa(d2i_PrivateKey(EVP_PKEY_RSA, nullptr, &at, length)); rsa)
        return {std::move(rsa), false};
    if (length > maxOther)
        return {};
    for (const int kind : {EVP_PKEY_EC, EVP_PKEY_DSA}) {
        at = der;
        if (Key key(d2i_PrivateKey(kind, nullptr, &at, length)); key)
            return {std::move(key), false};
    }
    return {};
}

Opened openSealed(const unsigned char *der, long length, const QByteArray &passPhrase) {
    if (length > maxKey)
        return {{}, true};
    const unsigned char *at = der;
    const Sealed sealed(d2i_X509_SIG(nullptr, &at, length));
    if (!sealed)
        return {};
    const X509_ALGOR *scheme = nullptr;
    X509_SIG_get0(sealed.get(), &scheme, nullptr);
    if (!isBearable(scheme))
        return {{}, true};
    if (passPhrase.isEmpty())
        return {};
    const Info info(PKCS8_decrypt(sealed.get(), passPhrase.constData(), static_cast<int>(passPhrase.size())));
    return info ? opened(info.get(), length) : Opened();
}

} // namespace PrivateKeys
