#pragma once

#include <cstdint>
#include <string>

namespace emulator {

/// A zip archive in memory, its entries stored as they are. Names are UTF-8 texts; an archive holds 65535
/// entries and four gigabytes at most.
class ZipWriter {
public:
    /// All entries carry the time, in UTC.
    explicit ZipWriter(std::int64_t timeMs);

    void add(const std::string &name, const std::string &content);
    /// The whole archive; to be called once, at the end.
    std::string finish();

private:
    std::uint32_t m_dosTime;
    std::string m_archive;
    std::string m_directory;
    std::uint16_t m_count = 0;
};

} // namespace emulator
