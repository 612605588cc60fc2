#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace emulator {

/// The plain secret of a ciphered password, nothing for a text that does not authenticate.
std::optional<std::string> plainPassword(std::string_view cipher);

/// The ciphered form of a response's data. Throws std::runtime_error when the cipher library fails.
std::string cipheredData(std::string_view plain);

/// True when the cipher library can use its key.
bool ciphersWork();

/// A salted, slow hash of a password, which is all that is kept of it.
struct PasswordHash {
    std::string salt; ///< hex
    std::string hash; ///< hex
    int rounds = 0;
};

PasswordHash hashPassword(std::string_view password);
bool passwordMatches(std::string_view password, const PasswordHash &known);

/// The accounts of a device: the one that may do everything, under which the service works, and another.
inline constexpr std::string_view ownerAccount = "root";
bool isDeviceAccount(std::string_view name);

/// What is kept of a device's password, and whether a password is the one of which it was kept. A fleet may
/// have tens of thousands of them, so they are hashed with less effort.
std::string deviceSecret(std::string_view password);
bool opensDevice(std::string_view password, const std::string &secret);

/// 32 random bytes as base64url text.
std::string newSessionToken();

/// Lower-case hex of the SHA-256, under which a token is kept.
std::string fingerprint(std::string_view text);

std::string toHex(std::string_view bytes);
std::optional<std::string> fromHex(std::string_view hex);

} // namespace emulator
