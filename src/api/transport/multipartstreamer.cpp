#include "api/transport/multipartstreamer.h"

#include "api/transport/multipartbody.h"
#include "api/transport/requestdeadline.h"
#include "api/transport/responseheaderguard.h"
#include "api/transport/transfer.h"

#include <httplib.h>

#include <algorithm>

namespace {

/// What is read from a file at once.
constexpr std::size_t blockSize = 256u << 10;
/// What is sent at once, a TLS record: on a slow line anything larger would be long without progress.
constexpr std::size_t pieceSize = 16u << 10;

} // namespace

MultipartStreamer::MultipartStreamer(MultipartBody &form, Transfer &transfer, RequestDeadline &deadline,
                                     const ResponseHeaderGuard &head)
    : m_form(form), m_transfer(transfer), m_deadline(deadline), m_head(head), m_block(blockSize) {}

void MultipartStreamer::attach(httplib::Request &message) {
    message.content_length_ = m_form.length();
    message.content_provider_ = [this](std::size_t offset, std::size_t length, httplib::DataSink &sink) {
        return send(offset, length, sink);
    };
}

void MultipartStreamer::rethrow() const {
    if (m_error)
        std::rethrow_exception(m_error);
}

bool MultipartStreamer::send(std::uint64_t offset, std::size_t length, httplib::DataSink &sink) {
    m_refusal = m_head.earlyRefusal();
    if (m_refusal != 0)
        return false;
    try {
        if (sendBlock(offset, length, sink))
            return true;
        // What could not be sent any more may have been refused before.
        m_refusal = m_transfer.isCancelled() ? 0 : m_head.earlyRefusal();
    } catch (...) {
        m_error = std::current_exception();
    }
    return false;
}

bool MultipartStreamer::sendBlock(std::uint64_t offset, std::size_t length, httplib::DataSink &sink) {
    const std::size_t count = m_form.read(offset, m_block.data(), std::min(length, m_block.size()));
    for (std::size_t done = 0; done < count;) {
        const std::size_t piece = std::min(pieceSize, count - done);
        if (m_transfer.isCancelled() || !sink.write(m_block.data() + done, piece))
            return false;
        done += piece;
        m_deadline.restart();
        m_transfer.advance(offset + done);
    }
    return count > 0;
}
