#pragma once

#include <QFile>

#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>

/// A file to be sent, which has to stay as it was from the first look at it to its last byte.
///
/// It is open only while it is read, so that there may be many of them. Everything that goes wrong is a
/// TransferError, which names the file as people know it.
class UnchangedFile {
public:
    /// Looks at the file: it has to be a plain one, readable, and not empty. path: UTF-8.
    UnchangedFile(const std::string &path, std::string name);

    std::uint64_t size() const { return m_seen.size; }

    /// Fills the buffer from the offset; the bytes have to be there. They are handed out only when the file
    /// is still the one that was looked at.
    void read(std::uint64_t offset, char *to, std::size_t length);

private:
    struct State {
        std::uint64_t size = 0;
        std::filesystem::file_time_type changed;
        bool operator==(const State &) const = default;
    };

    void open();
    State look() const;
    void requireSame() const;

    std::filesystem::path m_path;
    std::string m_name;
    State m_seen;
    std::unique_ptr<QFile> m_file;
};
