#include "devices/zipwriter.h"

#include "simulation/clock.h"

#include <array>
#include <utility>

namespace emulator {

namespace {

constexpr std::uint16_t versionNeeded = 20;
constexpr std::uint16_t madeOnUnix = 3 << 8 | versionNeeded;
constexpr std::uint16_t utf8Names = 1 << 11;
constexpr std::uint16_t stored = 0;
constexpr std::uint32_t fileReadableByOwner = 0100600U << 16;

constexpr std::array<std::uint32_t, 256> crcTable() {
    std::array<std::uint32_t, 256> table{};
    for (std::uint32_t i = 0; i < table.size(); ++i) {
        std::uint32_t value = i;
        for (int bit = 0; bit < 8; ++bit)
            value = (value >> 1) ^ ((value & 1) != 0 ? 0xedb88320U : 0);
        table[i] = value;
    }
    return table;
}

std::uint32_t crcOf(const std::string &bytes) {
    static constexpr auto table = crcTable();
    std::uint32_t crc = 0xffffffffU;
    for (const char byte : bytes)
        crc = table[(crc ^ static_cast<unsigned char>(byte)) & 0xff] ^ (crc >> 8);
    return ~crc;
}

void put16(std::string &out, std::uint16_t value) {
    out += static_cast<char>(value & 0xff);
    out += static_cast<char>(value >> 8);
}

void put32(std::string &out, std::uint32_t value) {
    put16(out, static_cast<std::uint16_t>(value & 0xffff));
    put16(out, static_cast<std::uint16_t>(value >> 16));
}

std::uint32_t dosTimeOf(std::int64_t timeMs) {
    const std::tm parts = utcParts(timeMs);
    // The format counts years from 1980 and seconds in twos.
    const auto date =
        static_cast<std::uint32_t>((parts.tm_year - 80) << 9 | (parts.tm_mon + 1) << 5 | parts.tm_mday);
    const auto time = static_cast<std::uint32_t>(parts.tm_hour << 11 | parts.tm_min << 5 | parts.tm_sec / 2);
    return date << 16 | time;
}

} // namespace

ZipWriter::ZipWriter(std::int64_t timeMs) : m_dosTime(dosTimeOf(timeMs)) {}

void ZipWriter::add(const std::string &name, const std::string &content) {
    // What the entry's own head and its line in the directory have in common.
    std::string common;
    put16(common, versionNeeded);
    put16(common, utf8Names);
    put16(common, stored);
    put32(common, m_dosTime);
    put32(common, crcOf(content));
    put32(common, static_cast<std::uint32_t>(content.size()));
    put32(common, static_cast<std::uint32_t>(content.size()));
    put16(common, static_cast<std::uint16_t>(name.size()));
    put16(common, 0); // no extra field

    m_directory += "PK\x01\x02";
    put16(m_directory, madeOnUnix);
    m_directory += common;
    put16(m_directory, 0); // no comment
    put16(m_directory, 0); // first disk
    put16(m_directory, 1); // a text
    put32(m_directory, fileReadableByOwner);
    put32(m_directory, static_cast<std::uint32_t>(m_archive.size()));
    m_directory += name;

    m_archive += "PK\x03\x04" + common + name + content;
    ++m_count;
}

std::string ZipWriter::finish() {
    const auto directoryAt = static_cast<std::uint32_t>(m_archive.size());
    m_archive += m_directory + "PK\x05\x06";
    put32(m_archive, 0); // one disk
    put16(m_archive, m_count);
    put16(m_archive, m_count);
    put32(m_archive, static_cast<std::uint32_t>(m_directory.size()));
    put32(m_archive, directoryAt);
    put16(m_archive, 0); // no comment
    return std::move(m_archive);
}

} // namespace emulator
