#include "api/transport/multipartbody.h"

#include <QUuid>

#include <algorithm>
#include <cstring>

namespace {

/// A name as it may stand between quotes in a part's head: what could end the quotes or the line is
/// percent-encoded, as browsers do it.
std::string quotable(const std::string &name) {
    constexpr const char *digits = "0123456789ABCDEF";
    std::string text;
    for (const char c : name) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte >= 0x20 && byte != 0x7f && c != '"' && c != '\\')
            text += c;
        else
            text.append({'%', digits[byte >> 4], digits[byte & 15]});
    }
    return text;
}

} // namespace

MultipartBody::MultipartBody()
    : m_boundary("form-" + QUuid::createUuid().toString(QUuid::Id128).toStdString()) {}

void MultipartBody::addText(const std::string &name, const std::string &fileName,
                            const std::string &content) {
    append(partHead(name, fileName, nullptr) + content + "\r\n");
}

void MultipartBody::addFile(const UploadPart &part) {
    append(partHead(part.name, part.fileName, "application/octet-stream"));
    append(UnchangedFile(part.path, part.fileName));
    append("\r\n");
}

void MultipartBody::close() {
    append("--" + m_boundary + "--\r\n");
}

std::string MultipartBody::contentType() const {
    return "multipart/form-data; boundary=" + m_boundary;
}

std::size_t MultipartBody::read(std::uint64_t offset, char *to, std::size_t room) {
    auto segment = std::upper_bound(
        m_segments.begin(), m_segments.end(), offset,
        [](std::uint64_t at, const Segment &other) { return at < other.begin + other.size; });
    std::size_t done = 0;
    for (; segment != m_segments.end() && done < room; ++segment) {
        const std::uint64_t inside = offset + done - segment->begin;
        const auto count =
            static_cast<std::size_t>(std::min<std::uint64_t>(room - done, segment->size - inside));
        if (segment->file)
            segment->file->read(inside, to + done, count);
        else
            std::memcpy(to + done, segment->text.data() + inside, count);
        done += count;
    }
    return done;
}

void MultipartBody::append(std::string text) {
    const std::uint64_t size = text.size();
    m_segments.push_back({m_length, size, std::move(text), std::nullopt});
    m_length += size;
}

void MultipartBody::append(UnchangedFile file) {
    const std::uint64_t size = file.size();
    m_segments.push_back({m_length, size, {}, std::move(file)});
    m_length += size;
}

std::string MultipartBody::partHead(const std::string &name, const std::string &fileName,
                                    const char *type) const {
    std::string head = "--" + m_boundary + "\r\nContent-Disposition: form-data; name=\"" + quotable(name) +
                       "\"; filename=\"" + quotable(fileName) + "\"\r\n";
    if (type)
        head += std::string("Content-Type: ") + type + "\r\n";
    return head + "\r\n";
}
