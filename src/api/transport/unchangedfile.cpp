#include "api/transport/unchangedfile.h"

#include "api/transport/transfererror.h"

namespace fs = std::filesystem;

UnchangedFile::UnchangedFile(const std::string &path, std::string name)
    : m_path(std::u8string(path.begin(), path.end())), m_name(std::move(name)) {
    std::error_code error;
    // Before anything is opened: opening a pipe would wait for its other end.
    if (!fs::is_regular_file(m_path, error))
        throw TransferError(TransferFailure::FileUnreadable, "no plain file", m_name);
    m_seen = look();
    if (m_seen.size == 0)
        throw TransferError(TransferFailure::FileEmpty, "the file is empty", m_name);
    open();
    m_file.reset();
}

void UnchangedFile::read(std::uint64_t offset, char *to, std::size_t length) {
    if (!m_file)
        open();
    if (static_cast<std::uint64_t>(m_file->pos()) != offset && !m_file->seek(static_cast<qint64>(offset)))
        throw TransferError(TransferFailure::FileUnreadable, "the file cannot be read", m_name);
    for (std::size_t done = 0; done < length;) {
        const qint64 count = m_file->read(to + done, static_cast<qint64>(length - done));
        if (count < 0)
            throw TransferError(TransferFailure::FileUnreadable, "the file cannot be read", m_name);
        if (count == 0)
            throw TransferError(TransferFailure::FileChanged, "the file has shrunk", m_name);
        done += static_cast<std::size_t>(count);
    }
    requireSame();
    if (offset + length == m_seen.size)
        m_file.reset();
}

void UnchangedFile::open() {
    auto file = std::make_unique<QFile>(m_path);
    if (!file->open(QIODevice::ReadOnly | QIODevice::Unbuffered)) {
        look();
        throw TransferError(TransferFailure::FileUnreadable, "the file cannot be opened", m_name);
    }
    m_file = std::move(file);
}

/// By its path and not by the open file, which would outlive its own removal.
UnchangedFile::State UnchangedFile::look() const {
    std::error_code noSize;
    std::error_code noTime;
    const State state{fs::file_size(m_path, noSize), fs::last_write_time(m_path, noTime)};
    if (noSize || noTime)
        throw TransferError(TransferFailure::FileGone, "the file has disappeared", m_name);
    return state;
}

void UnchangedFile::requireSame() const {
    if (look() != m_seen)
        throw TransferError(TransferFailure::FileChanged, "the file has changed", m_name);
}
