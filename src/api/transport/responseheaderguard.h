#pragma once

#include <openssl/types.h>

#include <cstddef>

/// Watches what a service sends on a TLS connection before the transport reads it as an answer.
///
/// It keeps the head of an answer within bounds: the transport reads a status line of any length and then
/// matches it with a recursive expression, whose stack a long line would overflow. And it tells when a
/// service answers while the request is still being sent, which the transport does not look for.
class ResponseHeaderGuard {
public:
    /// The context may call back as long as it lives.
    void watch(SSL_CTX *context);
    /// The head is complete; the body has a limit of its own.
    void lift() { m_lifted = true; }

    /// The connection; null before the handshake.
    SSL *session() const { return m_session; }

    /// The status with which the service refuses a request that is not sent yet; 0 while it does not. Nothing
    /// is taken from the connection.
    int earlyRefusal() const;

private:
    static void onMessage(int isSent, int version, int type, const void *bytes, std::size_t length,
                          SSL *session, void *head);
    void addRecord(std::size_t length, SSL *session);

    SSL *m_session = nullptr;
    std::size_t m_received = 0;
    bool m_established = false; ///< the first handshake is complete; a later one lifts no limit
    bool m_lifted = false;
};
