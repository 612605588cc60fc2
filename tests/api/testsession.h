#pragma once

#include "api/client/apiclient.h"
#include "platform/crypto/ciphers.h"
#include "platform/crypto/nvlcrypto.h"

#include <nlohmann/json.hpp>

#include <memory>
#include <string>

/// A client with a session that a scripted service need not know.
namespace TestSession {

inline constexpr const char *account = "admin@example.com";
inline constexpr const char *token = "session-token_0123456789";

inline std::unique_ptr<CApiClient> client(std::uint32_t port) {
    auto made = std::make_unique<CApiClient>("127.0.0.1", port);
    made->setAccount(account);
    made->setAccessToken(Ciphers::sealSecret(token).value_or("").c_str());
    return made;
}

/// "data" as the service ciphers it.
inline std::string sealed(const std::string &plain) {
    char *out = nullptr;
    if (dataToCypher(plain.data(), plain.size(), &out) != 0)
        return {};
    const std::string text(out);
    nvlcryptoFree(out);
    return text;
}

} // namespace TestSession
