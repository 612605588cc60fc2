#include "api/transport/responseheaderguard.h"

#include "platform/system/socketshutdown.h"

#include <openssl/err.h>
#include <openssl/ssl.h>

#include <algorithm>
#include <cctype>
#include <string_view>

namespace {

/// The TLS record (16 KiB) that goes beyond it is still read.
constexpr std::size_t headLimit = 16u << 10;
constexpr int firstRefusal = 300;

/// Of the beginning of an answer, "HTTP/1.1 413 …"; 0 when it is none.
int statusOf(std::string_view text) {
    constexpr std::size_t at = 9;
    if (text.size() < at + 3 || !text.starts_with("HTTP/1."))
        return 0;
    int status = 0;
    for (const char c : text.substr(at, 3)) {
        if (!std::isdigit(static_cast<unsigned char>(c)))
            return 0;
        status = status * 10 + (c - '0');
    }
    return status;
}

} // namespace

void ResponseHeaderGuard::watch(SSL_CTX *context) {
    SSL_CTX_set_msg_callback(context, &ResponseHeaderGuard::onMessage);
    SSL_CTX_set_msg_callback_arg(context, this);
}

int ResponseHeaderGuard::earlyRefusal() const {
    if (!m_session || (SSL_pending(m_session) == 0 && !isSocketReadable(SSL_get_fd(m_session))))
        return 0;
    char bytes[32];
    // In that mode it would wait for more when what has come is a session ticket alone.
    SSL_clear_mode(m_session, SSL_MODE_AUTO_RETRY);
    const int count = SSL_peek(m_session, bytes, sizeof bytes);
    SSL_set_mode(m_session, SSL_MODE_AUTO_RETRY);
    // What is left in the queue would be taken for the next call's.
    ERR_clear_error();
    const int status = statusOf({bytes, static_cast<std::size_t>(std::max(count, 0))});
    return status >= firstRefusal ? status : 0;
}

void ResponseHeaderGuard::onMessage(int isSent, int, int type, const void *bytes, std::size_t, SSL *session,
                                    void *head) {
    auto *self = static_cast<ResponseHeaderGuard *>(head);
    self->m_session = session;
    self->m_established = self->m_established || SSL_is_init_finished(session);
    if (isSent || type != SSL3_RT_HEADER || !self->m_established)
        return;
    const auto *recordHead = static_cast<const unsigned char *>(bytes);
    self->addRecord(recordHead[3] * 256u + recordHead[4], session);
}

void ResponseHeaderGuard::addRecord(std::size_t length, SSL *session) {
    // What came before counts: a record may hold the end of the head and the beginning of the body.
    if (!m_lifted && m_received > headLimit)
        SSL_set_shutdown(session, SSL_get_shutdown(session) | SSL_RECEIVED_SHUTDOWN);
    m_received += length;
}
