#include "http/generictoken.h"

#include "http/utf8path.h"
#include "tables/credentials.h"

#include <openssl/core_names.h>
#include <openssl/crypto.h>
#include <openssl/evp.h>
#include <openssl/hmac.h>
#include <openssl/kdf.h>
#include <openssl/params.h>

#include <fstream>
#include <iterator>
#include <memory>
#include <optional>
#include <stdexcept>
#include <string>

namespace emulator {

namespace {

using Key = std::array<unsigned char, 32>;

constexpr std::string_view prefix = "G1:";
constexpr std::size_t signedBytes = 24;
constexpr std::size_t macBytes = 32;
constexpr std::int64_t windowMs = 10LL * 60 * 1000;

Key keyOf(std::string_view bytes) {
    Key key;
    std::copy(bytes.begin(), bytes.end(), key.begin());
    return key;
}

std::string trimmed(const std::string &text) {
    static constexpr auto blanks = " \t\r\n\v\f";
    const auto first = text.find_first_not_of(blanks);
    return first == std::string::npos ? std::string()
                                      : text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

Key masterKey(const std::filesystem::path &folder) {
    const auto path = folder / "nvlcrypto.key";
    if (!std::filesystem::exists(path))
        return keyOf(*fromHex(fingerprint("Norvell Device Manager")));
    std::ifstream file(path);
    const std::string text((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    const auto bytes = fromHex(trimmed(text));
    if (!bytes || bytes->size() != Key().size())
        throw std::runtime_error("the key file " + utf8(path) + " is malformed");
    return keyOf(*bytes);
}

Key tokenKey(Key master) {
    const std::unique_ptr<EVP_KDF, decltype(&EVP_KDF_free)> kdf(EVP_KDF_fetch(nullptr, "HKDF", nullptr),
                                                                &EVP_KDF_free);
    const std::unique_ptr<EVP_KDF_CTX, decltype(&EVP_KDF_CTX_free)> context(EVP_KDF_CTX_new(kdf.get()),
                                                                            &EVP_KDF_CTX_free);
    std::string digest = "SHA256";
    std::string info = "nvl/token/1";
    const OSSL_PARAM params[] = {
        OSSL_PARAM_construct_utf8_string(OSSL_KDF_PARAM_DIGEST, digest.data(), 0),
        OSSL_PARAM_construct_octet_string(OSSL_KDF_PARAM_KEY, master.data(), master.size()),
        OSSL_PARAM_construct_octet_string(OSSL_KDF_PARAM_INFO, info.data(), info.size()),
        OSSL_PARAM_construct_end(),
    };
    Key key;
    if (!context || EVP_KDF_derive(context.get(), key.data(), key.size(), params) != 1)
        throw std::runtime_error("the token key cannot be derived");
    return key;
}

int urlDigit(char c) {
    static constexpr std::string_view alphabet =
        "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789-_";
    const auto at = alphabet.find(c);
    return at == std::string_view::npos ? -1 : static_cast<int>(at);
}

/// Nothing for a character outside the alphabet and for left-over bits that are not zero.
std::optional<std::string> fromBase64Url(std::string_view text) {
    std::string bytes;
    unsigned bits = 0;
    int held = 0;
    for (const char c : text) {
        const int digit = urlDigit(c);
        if (digit < 0)
            return std::nullopt;
        bits = (bits << 6) | static_cast<unsigned>(digit);
        held += 6;
        if (held >= 8) {
            held -= 8;
            bytes += static_cast<char>((bits >> held) & 0xffU);
        }
    }
    if (held >= 6 || (bits & ((1U << held) - 1)) != 0)
        return std::nullopt;
    return bytes;
}

std::int64_t timeOf(std::string_view bytes) {
    std::uint64_t time = 0;
    for (std::size_t i = 0; i < 8; ++i)
        time = (time << 8) | static_cast<unsigned char>(bytes[i]);
    return static_cast<std::int64_t>(time);
}

} // namespace

GenericTokenJudge::GenericTokenJudge(const std::filesystem::path &keyFolder)
    : m_key(tokenKey(masterKey(keyFolder))) {}

bool GenericTokenJudge::accepts(std::string_view token, std::int64_t nowMs) const {
    if (token.substr(0, prefix.size()) != prefix)
        return false;
    const auto bytes = fromBase64Url(token.substr(prefix.size()));
    if (!bytes || bytes->size() != signedBytes + macBytes)
        return false;
    unsigned char mac[EVP_MAX_MD_SIZE];
    unsigned length = 0;
    HMAC(EVP_sha256(), m_key.data(), static_cast<int>(m_key.size()),
         reinterpret_cast<const unsigned char *>(bytes->data()), signedBytes, mac, &length);
    if (length != macBytes || CRYPTO_memcmp(mac, bytes->data() + signedBytes, macBytes) != 0)
        return false;
    const std::int64_t time = timeOf(*bytes);
    return time >= nowMs - windowMs && time <= nowMs + windowMs;
}

} // namespace emulator
