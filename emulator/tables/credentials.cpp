#include "tables/credentials.h"

#include "platform/crypto/nvlcrypto.h"

#include <openssl/crypto.h>
#include <openssl/evp.h>
#include <openssl/rand.h>

#include <array>
#include <memory>
#include <stdexcept>

namespace emulator {

namespace {

constexpr int hashRounds = 60000;
constexpr int deviceRounds = 1000;
constexpr std::size_t hashBytes = 32;

struct FreeCipherText {
    void operator()(char *text) const { nvlcryptoFree(text); }
};
using CipherText = std::unique_ptr<char, FreeCipherText>;

using Operation = int (*)(const char *, std::size_t, char **);

std::optional<std::string> call(Operation operation, std::string_view input) {
    char *raw = nullptr;
    const int failed = operation(input.data(), input.size(), &raw);
    const CipherText text(raw);
    if (failed != 0 || !text)
        return std::nullopt;
    return std::string(text.get());
}

unsigned char *bytesOf(std::string &text) {
    return reinterpret_cast<unsigned char *>(text.data());
}

const unsigned char *bytesOf(std::string_view text) {
    return reinterpret_cast<const unsigned char *>(text.data());
}

std::string randomBytes(std::size_t count) {
    std::string bytes(count, '\0');
    if (RAND_bytes(bytesOf(bytes), static_cast<int>(count)) != 1)
        throw std::runtime_error("no random bytes");
    return bytes;
}

std::string stretched(std::string_view password, std::string_view salt, int rounds) {
    std::string hash(hashBytes, '\0');
    if (PKCS5_PBKDF2_HMAC(password.data(), static_cast<int>(password.size()), bytesOf(salt),
                          static_cast<int>(salt.size()), rounds, EVP_sha256(), static_cast<int>(hashBytes),
                          bytesOf(hash)) != 1)
        throw std::runtime_error("a password cannot be hashed");
    return hash;
}

PasswordHash hashed(std::string_view password, int rounds) {
    const std::string salt = randomBytes(16);
    return {toHex(salt), toHex(stretched(password, salt, rounds)), rounds};
}

int hexDigit(char c) {
    if (c >= '0' && c <= '9')
        return c - '0';
    const char lower = static_cast<char>(c | 0x20);
    return lower >= 'a' && lower <= 'f' ? lower - 'a' + 10 : -1;
}

} // namespace

std::optional<std::string> plainPassword(std::string_view cipher) {
    return call(&cipherToPass, cipher);
}

std::string cipheredData(std::string_view plain) {
    auto text = call(&dataToCypher, plain);
    if (!text)
        throw std::runtime_error("the response's data cannot be ciphered");
    return std::move(*text);
}

bool ciphersWork() {
    char *raw = nullptr;
    const int failed = createGenericToken(&raw);
    const CipherText token(raw);
    return failed == 0 && token;
}

PasswordHash hashPassword(std::string_view password) {
    return hashed(password, hashRounds);
}

bool passwordMatches(std::string_view password, const PasswordHash &known) {
    const auto salt = fromHex(known.salt);
    const auto hash = fromHex(known.hash);
    if (!salt || !hash || hash->size() != hashBytes || known.rounds <= 0)
        return false;
    const std::string offered = stretched(password, *salt, known.rounds);
    return CRYPTO_memcmp(offered.data(), hash->data(), hashBytes) == 0;
}

bool isDeviceAccount(std::string_view name) {
    return name == ownerAccount || name == "admin";
}

std::string deviceSecret(std::string_view password) {
    const PasswordHash hash = hashed(password, deviceRounds);
    return hash.salt + ':' + hash.hash;
}

bool opensDevice(std::string_view password, const std::string &secret) {
    const auto colon = secret.find(':');
    return colon != std::string::npos &&
           passwordMatches(password, {secret.substr(0, colon), secret.substr(colon + 1), deviceRounds});
}

std::string newSessionToken() {
    static constexpr std::string_view alphabet =
        "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789-_";
    std::string token;
    unsigned bits = 0;
    int held = 0;
    for (const char byte : randomBytes(32)) {
        bits = (bits << 8) | static_cast<unsigned char>(byte);
        for (held += 8; held >= 6; held -= 6)
            token += alphabet[(bits >> (held - 6)) & 63U];
    }
    token += alphabet[(bits << (6 - held)) & 63U];
    return token;
}

std::string fingerprint(std::string_view text) {
    std::string digest(hashBytes, '\0');
    unsigned length = 0;
    if (EVP_Digest(text.data(), text.size(), bytesOf(digest), &length, EVP_sha256(), nullptr) != 1)
        throw std::runtime_error("a token cannot be hashed");
    return toHex(digest);
}

std::string toHex(std::string_view bytes) {
    static constexpr std::string_view digits = "0123456789abcdef";
    std::string hex;
    hex.reserve(bytes.size() * 2);
    for (const char byte : bytes) {
        hex += digits[static_cast<unsigned char>(byte) >> 4];
        hex += digits[static_cast<unsigned char>(byte) & 15];
    }
    return hex;
}

std::optional<std::string> fromHex(std::string_view hex) {
    if (hex.size() % 2 != 0)
        return std::nullopt;
    std::string bytes;
    for (std::size_t i = 0; i < hex.size(); i += 2) {
        const int high = hexDigit(hex[i]);
        const int low = hexDigit(hex[i + 1]);
        if (high < 0 || low < 0)
            return std::nullopt;
        bytes += static_cast<char>(high * 16 + low);
    }
    return bytes;
}

} // namespace emulator
