#include "api/transport/responsebody.h"

#include "platform/system/socketshutdown.h"

#include <openssl/err.h>
#include <openssl/ssl.h>

#include <algorithm>
#include <charconv>

namespace {

constexpr std::size_t recordSize = 16u << 10;
/// Of the length of a chunk with what may be said about it, or of a line after the last one.
constexpr std::size_t lineLimit = 4u << 10;

/// Whether the connection has ended in order, or as services end it that do not take leave.
bool isEndOfConnection(int error) {
    return error == SSL_ERROR_ZERO_RETURN ||
           (error == SSL_ERROR_SSL && ERR_GET_REASON(ERR_peek_error()) == SSL_R_UNEXPECTED_EOF_WHILE_READING);
}

} // namespace

ResponseBody::ResponseBody(SSL *session, std::chrono::milliseconds wait, std::uint64_t limit, Taker take)
    : m_session(session), m_wait(wait), m_limit(limit), m_take(std::move(take)) {}

ResponseBody::End ResponseBody::read(const Framing &framing) {
    try {
        switch (framing.kind) {
        case Length::Known:
            readPart(framing.length);
            break;
        case Length::Chunked:
            readChunks();
            break;
        case Length::UntilClose:
            readUntilClose();
            break;
        }
        return End::Whole;
    } catch (End end) {
        return end;
    }
}

void ResponseBody::readChunks() {
    while (const std::uint64_t length = chunkLength()) {
        readPart(length);
        if (!readLine().empty())
            throw End::Refused;
    }
    while (!readLine().empty()) {
    }
}

/// Looks at the length first: what is too long need not be read up to the limit.
void ResponseBody::readPart(std::uint64_t length) {
    if (length > m_limit)
        throw End::Refused;
    while (length > 0) {
        if (m_next == m_buffer.size() && !receive())
            throw End::Lost;
        length -= takeSome(length);
    }
}

void ResponseBody::readUntilClose() {
    while (m_next < m_buffer.size() || receive())
        takeSome(m_buffer.size());
}

std::uint64_t ResponseBody::chunkLength() {
    const std::string line = readLine();
    std::uint64_t length = 0;
    const char *const end = line.data() + line.size();
    const auto [stop, error] = std::from_chars(line.data(), end, length, 16);
    if (error != std::errc() || (stop != end && *stop != ';' && *stop != ' '))
        throw End::Refused;
    return length;
}

std::string ResponseBody::readLine() {
    std::size_t end = 0;
    while ((end = m_buffer.find("\r\n", m_next)) == std::string::npos) {
        if (m_buffer.size() - m_next > lineLimit)
            throw End::Refused;
        if (!receive())
            throw End::Lost;
    }
    if (end - m_next > lineLimit)
        throw End::Refused;
    std::string line = m_buffer.substr(m_next, end - m_next);
    m_next = end + 2;
    return line;
}

std::size_t ResponseBody::takeSome(std::uint64_t most) {
    const auto length = static_cast<std::size_t>(std::min<std::uint64_t>(most, m_buffer.size() - m_next));
    if (!m_take(m_buffer.data() + m_next, length))
        throw End::Refused;
    m_next += length;
    return length;
}

bool ResponseBody::receive() {
    m_buffer.erase(0, m_next);
    m_next = 0;
    char bytes[recordSize];
    while (true) {
        if (SSL_pending(m_session) == 0 && !isSocketReadable(SSL_get_fd(m_session), m_wait))
            throw End::Lost;
        ERR_clear_error();
        const int count = SSL_read(m_session, bytes, sizeof bytes);
        if (count > 0) {
            m_received += static_cast<std::size_t>(count);
            if (m_received > m_limit)
                throw End::Refused;
            m_buffer.append(bytes, static_cast<std::size_t>(count));
            return true;
        }
        const int error = SSL_get_error(m_session, count);
        const bool isEnd = isEndOfConnection(error);
        ERR_clear_error();
        if (isEnd)
            return false;
        // Something else than data has come, a session ticket for example.
        if (error != SSL_ERROR_WANT_READ)
            throw End::Lost;
    }
}
