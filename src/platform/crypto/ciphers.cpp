#include "platform/crypto/ciphers.h"

#include "platform/crypto/nvlcrypto.h"

namespace Ciphers {

namespace {

/// Takes over what an operation handed out.
std::optional<std::string> taken(int failure, char *text) {
    if (failure != 0 || !text)
        return std::nullopt;
    std::string value(text);
    nvlcryptoFree(text);
    return value;
}

std::optional<std::string> applied(int (*operation)(const char *, std::size_t, char **),
                                   std::string_view in) {
    char *out = nullptr;
    const int failure = operation(in.data(), in.size(), &out);
    return taken(failure, out);
}

} // namespace

std::optional<std::string> sealSecret(std::string_view secret) {
    return applied(passToCipher, secret);
}

std::optional<std::string> openSecret(std::string_view cipher) {
    return applied(cipherToPass, cipher);
}

std::optional<std::string> openData(std::string_view cypher) {
    return applied(cypherToData, cypher);
}

std::optional<std::string> genericToken() {
    char *out = nullptr;
    const int failure = createGenericToken(&out);
    return taken(failure, out);
}

} // namespace Ciphers
