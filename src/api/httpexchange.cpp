#include "httpexchange.h"

#include "requestdeadline.h"

#include <httplib.h>

namespace {

constexpr std::size_t bodyLimit = 64u << 20;
/// Of the head; the TLS record (16 KiB) that goes beyond it is still read.
constexpr std::size_t headLimit = 16u << 10;
constexpr const char *clientCertificate = "./client.cer";
constexpr const char *clientKey = "./client.key";

/// Keeps the head of an answer within bounds: the transport reads a status line of any length and then
/// matches it with a recursive expression, whose stack a long line would overflow.
class HeadLimit {
public:
    /// The context may call back as long as it lives.
    void watch(SSL_CTX *context) {
        SSL_CTX_set_msg_callback(context, &HeadLimit::onMessage);
        SSL_CTX_set_msg_callback_arg(context, this);
    }
    /// The head is complete; the body has a limit of its own.
    void lift() { m_lifted = true; }

private:
    static void onMessage(int isSent, int, int type, const void *bytes, std::size_t, SSL *session,
                          void *limit) {
        if (isSent || type != SSL3_RT_HEADER || !SSL_is_init_finished(session))
            return;
        const auto *recordHead = static_cast<const unsigned char *>(bytes);
        static_cast<HeadLimit *>(limit)->addRecord(recordHead[3] * 256u + recordHead[4], session);
    }

    void addRecord(std::size_t length, SSL *session) {
        // What came before counts: a record may hold the end of the head and the beginning of the body.
        if (!m_lifted && m_received > headLimit)
            SSL_set_shutdown(session, SSL_get_shutdown(session) | SSL_RECEIVED_SHUTDOWN);
        m_received += length;
    }

    std::size_t m_received = 0;
    bool m_lifted = false;
};

/// With the client certificate when both of its files load, else without one: the service decides.
std::unique_ptr<httplib::SSLClient> makeClient(const HttpRequest &request) {
    const int port = static_cast<int>(request.port);
    auto client = std::make_unique<httplib::SSLClient>(request.host, port, clientCertificate, clientKey);
    if (!client->is_valid())
        client = std::make_unique<httplib::SSLClient>(request.host, port);
    return client;
}

void configure(httplib::SSLClient &client, const HttpRequest &request, RequestDeadline &deadline) {
    client.enable_server_certificate_verification(false);
    SSL_CTX_set_min_proto_version(client.ssl_context(), TLS1_2_VERSION);
    client.set_decompress(false);
    client.set_tcp_nodelay(true);
    client.set_socket_options(
        [&deadline](socket_t socket) { deadline.watch(static_cast<long long>(socket)); });
    // The library's own connect time-out (300 s) would outlast the request.
    const bool own = request.waitTimeout.count() > 0;
    client.set_connection_timeout(own ? request.waitTimeout : request.totalTimeout);
    if (own)
        client.set_read_timeout(request.waitTimeout);
}

} // namespace

HttpAnswer exchangeHttp(const HttpRequest &request) {
    HttpAnswer answer;
    if (request.port == 0 || request.port > 65535) {
        answer.error = "Invalid port";
        return answer;
    }
    RequestDeadline deadline(request.totalTimeout);
    HeadLimit head;
    const std::unique_ptr<httplib::SSLClient> client = makeClient(request);
    if (!client->is_valid()) {
        answer.error = "SSL context";
        return answer;
    }
    configure(*client, request, deadline);
    head.watch(client->ssl_context());

    httplib::Request message;
    message.method = request.verb;
    message.path = request.path;
    message.headers = {{"Content-Type", request.contentType}, {"Authorization", request.authorization}};
    message.body = request.body;
    message.response_handler = [&head](const httplib::Response &) {
        head.lift();
        return true;
    };
    message.content_receiver = [&answer](const char *data, std::size_t length, std::uint64_t, std::uint64_t) {
        if (answer.body.size() + length > bodyLimit)
            return false;
        answer.body.append(data, length);
        return true;
    };
    const httplib::Result result = client->send(message);
    if (!result) {
        answer.body.clear();
        answer.error = deadline.isOver() ? "Time is over" : httplib::to_string(result.error());
        return answer;
    }
    answer.arrived = true;
    answer.status = result->status;
    answer.authorization = result->get_header_value("Authorization");
    return answer;
}
