#pragma once

#include <array>
#include <cstdint>
#include <filesystem>
#include <string_view>

namespace emulator {

/// Judges the tokens of callers that have no session: made with the shared key, and not long ago.
class GenericTokenJudge {
public:
    /// Reads "nvlcrypto.key" in the folder where there is one. Throws std::runtime_error when it is
    /// malformed.
    explicit GenericTokenJudge(const std::filesystem::path &keyFolder);

    bool accepts(std::string_view token, std::int64_t nowMs) const;

private:
    std::array<unsigned char, 32> m_key{};
};

} // namespace emulator
