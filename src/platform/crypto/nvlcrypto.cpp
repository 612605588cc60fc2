#include "platform/crypto/nvlcrypto.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <climits>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <memory>
#include <mutex>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include <openssl/crypto.h>
#include <openssl/evp.h>
#include <openssl/hmac.h>
#include <openssl/kdf.h>
#include <openssl/rand.h>

namespace {

constexpr std::size_t keyBytes = 32;
constexpr std::size_t nonceBytes = 12;
constexpr std::size_t tagBytes = 16;
/// What four letters of base64 stand for.
constexpr std::size_t groupBytes = 3;
constexpr std::string_view builtInSeed = "Norvell Device Manager";
constexpr std::string_view keyFileName = "nvlcrypto.key";

/// Bytes that are wiped when they go out of scope.
class SecretBytes {
public:
    SecretBytes() = default;
    explicit SecretBytes(std::size_t size) : m_bytes(size) {}
    SecretBytes(SecretBytes &&) noexcept = default;
    SecretBytes &operator=(SecretBytes &&) = delete;
    SecretBytes(const SecretBytes &) = delete;
    SecretBytes &operator=(const SecretBytes &) = delete;
    ~SecretBytes() { OPENSSL_cleanse(m_bytes.data(), m_bytes.size()); }

    unsigned char *data() { return m_bytes.data(); }
    const unsigned char *data() const { return m_bytes.data(); }
    std::size_t size() const { return m_bytes.size(); }

private:
    std::vector<unsigned char> m_bytes;
};

using Bytes = std::vector<unsigned char>;

std::mutex keyFolderMutex;
std::string keyFolderOverride;

std::string environment(const char *name) {
    const char *value = std::getenv(name);
    return value ? value : "";
}

std::string defaultKeyFolder() {
    if (std::string root = environment("NVLDM_ROOT"); !root.empty())
        return root;
#ifdef _WIN32
    return "C:/ProgramData/Norvell Inc/Device Manager";
#else
    std::string data = environment("XDG_DATA_HOME");
    if (data.empty())
        data = environment("HOME") + "/.local/share";
    return data + "/Norvell Inc/Device Manager";
#endif
}

std::string keyFilePath() {
    std::lock_guard lock(keyFolderMutex);
    const std::string folder = keyFolderOverride.empty() ? defaultKeyFolder() : keyFolderOverride;
    return folder + "/" + std::string(keyFileName);
}

int hexValue(char c) {
    if (c >= '0' && c <= '9')
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

std::optional<SecretBytes> parseKey(std::string_view text) {
    const auto isSpace = [](char c) { return c == ' ' || (c >= '\t' && c <= '\r'); };
    while (!text.empty() && isSpace(text.front()))
        text.remove_prefix(1);
    while (!text.empty() && isSpace(text.back()))
        text.remove_suffix(1);
    if (text.size() != 2 * keyBytes)
        return std::nullopt;
    SecretBytes key(keyBytes);
    for (std::size_t i = 0; i < keyBytes; ++i) {
        const int high = hexValue(text[2 * i]);
        const int low = hexValue(text[2 * i + 1]);
        if (high < 0 || low < 0)
            return std::nullopt;
        key.data()[i] = static_cast<unsigned char>(high * 16 + low);
    }
    return key;
}

std::optional<SecretBytes> builtInKey() {
    SecretBytes key(keyBytes);
    if (!EVP_Digest(builtInSeed.data(), builtInSeed.size(), key.data(), nullptr, EVP_sha256(), nullptr))
        return std::nullopt;
    return key;
}

bool exists(const std::string &path) {
    std::FILE *file = std::fopen(path.c_str(), "rb");
    const bool absent = !file && (errno == ENOENT || errno == ENOTDIR);
    if (file)
        std::fclose(file);
    return !absent;
}

/// Read at every operation: a key file that appears or changes counts from the next operation on.
std::optional<SecretBytes> masterKey() {
    const std::string path = keyFilePath();
    if (!exists(path))
        return builtInKey();
    std::ifstream file(path, std::ios::binary);
    if (!file)
        return std::nullopt;
    std::string text((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    std::optional<SecretBytes> key = parseKey(text);
    OPENSSL_cleanse(text.data(), text.size());
    return key;
}

std::optional<SecretBytes> subkey(std::string_view info) {
    const std::optional<SecretBytes> master = masterKey();
    if (!master)
        return std::nullopt;
    const std::unique_ptr<EVP_PKEY_CTX, decltype(&EVP_PKEY_CTX_free)> context(
        EVP_PKEY_CTX_new_id(EVP_PKEY_HKDF, nullptr), &EVP_PKEY_CTX_free);
    SecretBytes key(keyBytes);
    std::size_t length = key.size();
    const auto *infoBytes = reinterpret_cast<const unsigned char *>(info.data());
    if (!context || EVP_PKEY_derive_init(context.get()) <= 0 ||
        EVP_PKEY_CTX_set_hkdf_md(context.get(), EVP_sha256()) <= 0 ||
        EVP_PKEY_CTX_set1_hkdf_key(context.get(), master->data(), static_cast<int>(master->size())) <= 0 ||
        EVP_PKEY_CTX_add1_hkdf_info(context.get(), infoBytes, static_cast<int>(info.size())) <= 0 ||
        EVP_PKEY_derive(context.get(), key.data(), &length) <= 0)
        return std::nullopt;
    return key;
}

std::string toBase64(const Bytes &bytes) {
    std::string text(4 * ((bytes.size() + 2) / 3) + 1, '\0');
    const int length = EVP_EncodeBlock(reinterpret_cast<unsigned char *>(text.data()), bytes.data(),
                                       static_cast<int>(bytes.size()));
    text.resize(static_cast<std::size_t>(length));
    return text;
}

std::optional<Bytes> fromBase64(std::string_view text) {
    if (text.empty() || text.size() % 4 != 0)
        return std::nullopt;
    Bytes bytes(text.size() / 4 * 3);
    const int length = EVP_DecodeBlock(bytes.data(), reinterpret_cast<const unsigned char *>(text.data()),
                                       static_cast<int>(text.size()));
    const std::size_t padding = text.ends_with("==") ? 2 : text.ends_with('=') ? 1 : 0;
    if (length <= static_cast<int>(padding))
        return std::nullopt;
    bytes.resize(static_cast<std::size_t>(length) - padding);
    // The decoder passes over blanks around the text, reads stray padding as zeros and drops what is left in
    // the last bits: there is one right text for bytes, and it differs from another one in these places
    // alone.
    const std::size_t tail = (bytes.size() - 1) / groupBytes * groupBytes;
    const Bytes first(bytes.begin(),
                      bytes.begin() + static_cast<std::ptrdiff_t>(std::min(bytes.size(), groupBytes)));
    const Bytes last(bytes.begin() + static_cast<std::ptrdiff_t>(tail), bytes.end());
    if (text.find('=') < text.size() - padding || !text.starts_with(toBase64(first)) ||
        !text.ends_with(toBase64(last)))
        return std::nullopt;
    return bytes;
}

std::string toBase64Url(const Bytes &bytes) {
    std::string text = toBase64(bytes);
    while (!text.empty() && text.back() == '=')
        text.pop_back();
    for (char &c : text)
        c = c == '+' ? '-' : c == '/' ? '_' : c;
    return text;
}

int handOut(std::string_view text, char **out) {
    auto *copy = static_cast<char *>(std::malloc(text.size() + 1));
    if (!copy)
        return 1;
    std::memcpy(copy, text.data(), text.size());
    copy[text.size()] = '\0';
    *out = copy;
    return 0;
}

using CipherContext = std::unique_ptr<EVP_CIPHER_CTX, decltype(&EVP_CIPHER_CTX_free)>;

/// One kind of cipher text: its label ("P1", "D1") is prefix and associated data at once.
struct CipherKind {
    std::string_view label;
    std::string_view keyInfo;
};
constexpr CipherKind passKind{"P1", "nvl/pass/1"};
constexpr CipherKind dataKind{"D1", "nvl/data/1"};

const unsigned char *labelBytes(const CipherKind &kind) {
    return reinterpret_cast<const unsigned char *>(kind.label.data());
}

int seal(const CipherKind &kind, const char *plain, std::size_t length, char **out) {
    const std::optional<SecretBytes> key = subkey(kind.keyInfo);
    const CipherContext context(EVP_CIPHER_CTX_new(), &EVP_CIPHER_CTX_free);
    Bytes sealed(nonceBytes + length + tagBytes);
    int written = 0;
    if (!key || !context || length > INT_MAX / 2 || RAND_bytes(sealed.data(), nonceBytes) != 1 ||
        EVP_EncryptInit_ex(context.get(), EVP_aes_256_gcm(), nullptr, key->data(), sealed.data()) != 1 ||
        EVP_EncryptUpdate(context.get(), nullptr, &written, labelBytes(kind),
                          static_cast<int>(kind.label.size())) != 1 ||
        EVP_EncryptUpdate(context.get(), sealed.data() + nonceBytes, &written,
                          reinterpret_cast<const unsigned char *>(plain), static_cast<int>(length)) != 1 ||
        EVP_EncryptFinal_ex(context.get(), sealed.data() + nonceBytes + length, &written) != 1 ||
        EVP_CIPHER_CTX_ctrl(context.get(), EVP_CTRL_GCM_GET_TAG, tagBytes,
                            sealed.data() + nonceBytes + length) != 1)
        return 1;
    return handOut(std::string(kind.label) + ":" + toBase64(sealed), out);
}

int open(const CipherKind &kind, const char *cipher, std::size_t length, char **out) {
    const std::string_view text(cipher, length);
    if (!text.starts_with(kind.label) || text.size() <= kind.label.size() || text[kind.label.size()] != ':')
        return 1;
    std::optional<Bytes> sealed = fromBase64(text.substr(kind.label.size() + 1));
    if (!sealed || sealed->size() < nonceBytes + tagBytes)
        return 1;
    const std::size_t plainLength = sealed->size() - nonceBytes - tagBytes;
    const std::optional<SecretBytes> key = subkey(kind.keyInfo);
    const CipherContext context(EVP_CIPHER_CTX_new(), &EVP_CIPHER_CTX_free);
    SecretBytes plain(plainLength + 1);
    int written = 0;
    if (!key || !context ||
        EVP_DecryptInit_ex(context.get(), EVP_aes_256_gcm(), nullptr, key->data(), sealed->data()) != 1 ||
        EVP_DecryptUpdate(context.get(), nullptr, &written, labelBytes(kind),
                          static_cast<int>(kind.label.size())) != 1 ||
        EVP_DecryptUpdate(context.get(), plain.data(), &written, sealed->data() + nonceBytes,
                          static_cast<int>(plainLength)) != 1 ||
        EVP_CIPHER_CTX_ctrl(context.get(), EVP_CTRL_GCM_SET_TAG, tagBytes,
                            sealed->data() + nonceBytes + plainLength) != 1 ||
        EVP_DecryptFinal_ex(context.get(), plain.data() + plainLength, &written) != 1)
        return 1;
    return handOut({reinterpret_cast<const char *>(plain.data()), plainLength}, out);
}

/// The C boundary: checks the pointers and lets no exception out.
template <typename Operation>
int guarded(const void *in, char **out, Operation operation) {
    if (!out)
        return 1;
    *out = nullptr;
    if (!in)
        return 1;
    try {
        return operation();
    } catch (...) {
        return 1;
    }
}

int makeGenericToken(char **token) {
    const std::optional<SecretBytes> key = subkey("nvl/token/1");
    const auto now = std::chrono::system_clock::now().time_since_epoch();
    const auto milliseconds =
        static_cast<std::uint64_t>(std::chrono::duration_cast<std::chrono::milliseconds>(now).count());
    constexpr std::size_t timeBytes = 8;
    constexpr std::size_t signedBytes = timeBytes + 16;
    Bytes bytes(signedBytes + 32);
    for (std::size_t i = 0; i < timeBytes; ++i)
        bytes[i] = static_cast<unsigned char>(milliseconds >> (8 * (timeBytes - 1 - i)));
    unsigned int macLength = 0;
    if (!key || RAND_bytes(bytes.data() + timeBytes, signedBytes - timeBytes) != 1 ||
        !HMAC(EVP_sha256(), key->data(), static_cast<int>(key->size()), bytes.data(), signedBytes,
              bytes.data() + signedBytes, &macLength))
        return 1;
    return handOut("G1:" + toBase64Url(bytes), token);
}

} // namespace

int nvlcryptoSetKeyFolder(const char *path, std::size_t length) {
    if (!path)
        return 1;
    std::lock_guard lock(keyFolderMutex);
    keyFolderOverride.assign(path, length);
    return 0;
}

int passToCipher(const char *secret, std::size_t length, char **cipher) {
    return guarded(secret, cipher, [&] { return length == 0 ? 1 : seal(passKind, secret, length, cipher); });
}

int cipherToPass(const char *cipher, std::size_t length, char **secret) {
    return guarded(cipher, secret, [&] { return open(passKind, cipher, length, secret); });
}

int dataToCypher(const char *data, std::size_t length, char **cypher) {
    return guarded(data, cypher, [&] { return seal(dataKind, data, length, cypher); });
}

int cypherToData(const char *cypher, std::size_t length, char **data) {
    return guarded(cypher, data, [&] { return open(dataKind, cypher, length, data); });
}

int createGenericToken(char **token) {
    return guarded(token, token, [&] { return makeGenericToken(token); });
}

void nvlcryptoFree(char *text) {
    if (text)
        OPENSSL_cleanse(text, std::strlen(text));
    std::free(text);
}
