#pragma once

#include <filesystem>
#include <string>

namespace emulator {

/// Texts are UTF-8 everywhere here; the library alone would take them for the system's older code.
inline std::filesystem::path pathOf(const std::string &text) {
    return std::u8string(text.begin(), text.end());
}

inline std::string utf8(const std::filesystem::path &path) {
    const std::u8string text = path.u8string();
    return {text.begin(), text.end()};
}

} // namespace emulator
