#pragma once

#include "api/transport/unchangedfile.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

/// A file of a form: the name of its part, where it is (UTF-8), and what it is called there.
struct UploadPart {
    std::string name;
    std::string path;
    std::string fileName;
};

/// The body of a multipart form whose files are read while it is sent.
///
/// Its length is known as soon as its parts are. Files that are not what they have to be, at first or later,
/// end in a TransferError.
class MultipartBody {
public:
    MultipartBody();

    /// A part of text with a file name but no type.
    void addText(const std::string &name, const std::string &fileName, const std::string &content);
    /// A part with the bytes of a file.
    void addFile(const UploadPart &part);
    /// The end of the form; nothing can be added afterwards.
    void close();

    std::string contentType() const;
    std::uint64_t length() const { return m_length; }

    /// Puts the bytes from the offset on into the buffer and gives their number: all that there is room for,
    /// up to the end of the form.
    std::size_t read(std::uint64_t offset, char *to, std::size_t room);

private:
    /// Text, or else a file.
    struct Segment {
        std::uint64_t begin;
        std::uint64_t size;
        std::string text;
        std::optional<UnchangedFile> file;
    };

    void append(std::string text);
    void append(UnchangedFile file);
    std::string partHead(const std::string &name, const std::string &fileName, const char *type) const;

    std::string m_boundary;
    std::vector<Segment> m_segments;
    std::uint64_t m_length = 0;
};
