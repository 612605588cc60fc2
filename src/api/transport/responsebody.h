#pragma once

#include <openssl/types.h>

#include <chrono>
#include <cstdint>
#include <functional>
#include <string>

/// Reads the body of a response from a TLS connection whose response head has been read.
///
/// In place of the transport's own reading, which takes lines of any number and length between the chunks,
/// and takes a body for whole whose chunk does not end where it said. Everything that comes in counts towards
/// the limit. Used by the thread of the request.
class ResponseBody {
public:
    enum class Length { Known, Chunked, UntilClose };
    enum class End {
        Whole,   ///< as long as the response said
        Lost,    ///< the connection ended before, or nothing came for too long
        Refused, ///< beyond the limit, against the rules, or by the taker
    };
    using Taker = std::function<bool(const char *bytes, std::size_t length)>;

    struct Framing {
        Length kind = Length::UntilClose;
        std::uint64_t length = 0; ///< with Known
    };

    /// wait: for the next bytes.
    ResponseBody(SSL *session, std::chrono::milliseconds wait, std::uint64_t limit, Taker take);

    End read(const Framing &framing);

private:
    void readChunks();
    void readPart(std::uint64_t length);
    void readUntilClose();
    std::uint64_t chunkLength();
    std::string readLine();
    /// Takes of what has been received, at most so much; returns how much it was.
    std::size_t takeSome(std::uint64_t most);
    /// False at the end of the connection.
    bool receive();

    SSL *m_session;
    std::chrono::milliseconds m_wait;
    std::uint64_t m_limit;
    Taker m_take;
    std::uint64_t m_received = 0;
    std::string m_buffer; ///< received and not taken: from m_next on
    std::size_t m_next = 0;
};
