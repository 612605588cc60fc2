#include "api/transport/httpexchange.h"

#include "api/transport/clientidentity.h"
#include "api/transport/downloadtarget.h"
#include "api/transport/multipartbody.h"
#include "api/transport/multipartstreamer.h"
#include "api/transport/requestdeadline.h"
#include "api/transport/responsebody.h"
#include "api/transport/responseheaderguard.h"
#include "api/transport/serverkeycheck.h"
#include "api/transport/transfererror.h"

#include <httplib.h>
#include <openssl/err.h>

#include <QByteArray>

#include <limits>
#include <memory>
#include <optional>

namespace {

constexpr std::uint64_t bodyLimit = 64u << 20;
constexpr std::uint64_t fileLimit = 4ull << 30;
constexpr std::chrono::seconds readWait{5};
constexpr int tooLarge = 413;
constexpr std::chrono::seconds transportGrace{5};

/// With the client certificate when both of its files load, else without one: the service decides.
std::unique_ptr<httplib::SSLClient> makeClient(const HttpRequest &request) {
    const int port = static_cast<int>(request.port);
    const ClientIdentity identity;
    std::unique_ptr<httplib::SSLClient> client;
    if (identity.isThere())
        client =
            std::make_unique<httplib::SSLClient>(request.host, port, identity.certificate(), identity.key());
    if (!client || !client->is_valid())
        client = std::make_unique<httplib::SSLClient>(request.host, port);
    // What is left in the queue would be taken for the handshake's.
    ERR_clear_error();
    return client;
}

/// Keeps what the system holds back for sending small: megabytes of it would pass for progress at once and
/// then, on a slow line, for a standstill.
void limitUnsent([[maybe_unused]] socket_t socket) {
#ifdef TCP_NOTSENT_LOWAT
    constexpr int most = 256 << 10;
    ::setsockopt(socket, IPPROTO_TCP, TCP_NOTSENT_LOWAT, &most, sizeof most);
#endif
}

void configure(httplib::SSLClient &client, const HttpRequest &request, RequestDeadline &deadline) {
    client.enable_server_certificate_verification(false);
    SSL_CTX_set_min_proto_version(client.ssl_context(), TLS1_2_VERSION);
    SSL_CTX_set_options(client.ssl_context(), SSL_OP_NO_RENEGOTIATION);
    client.set_decompress(false);
    client.set_tcp_nodelay(true);
    client.set_socket_options([&deadline, isTransfer = request.transfer != nullptr](socket_t socket) {
        deadline.watch(static_cast<long long>(socket));
        if (isTransfer)
            limitUnsent(socket);
    });
    // The library's own connect time-out (300 s) would outlast the request.
    const bool own = request.waitTimeout.count() > 0;
    client.set_connection_timeout(own ? request.waitTimeout : request.totalTimeout);
    if (own)
        client.set_read_timeout(request.waitTimeout);
    if (request.transfer) {
        // A service may need a while to store what it gets; it is the deadline that ends a standstill.
        client.set_connection_timeout(request.totalTimeout + transportGrace);
        client.set_read_timeout(request.totalTimeout + transportGrace);
        client.set_write_timeout(request.totalTimeout + transportGrace);
    }
}

std::chrono::milliseconds waitOf(const HttpRequest &request) {
    if (request.transfer)
        return request.totalTimeout + transportGrace;
    return request.waitTimeout.count() > 0 ? request.waitTimeout : readWait;
}

ResponseBody::Framing framingOf(const httplib::Response &response) {
    using Length = ResponseBody::Length;
    constexpr int noContent = 204;
    constexpr int notModified = 304;
    if (response.status == noContent || response.status == notModified)
        return {Length::Known, 0};
    if (QByteArray::fromStdString(response.get_header_value("Transfer-Encoding")).toLower() == "chunked")
        return {Length::Chunked, 0};
    if (!response.has_header("Content-Length"))
        return {};
    bool isNumber = false;
    const QByteArray length = QByteArray::fromStdString(response.get_header_value("Content-Length"));
    const qulonglong bytes = length.toULongLong(&isNumber);
    return {Length::Known, isNumber ? bytes : std::numeric_limits<std::uint64_t>::max()};
}

/// The body of the answer as it comes in.
class Receiver {
public:
    Receiver(const HttpRequest &request, HttpResponse &answer, RequestDeadline &deadline)
        : m_request(request), m_answer(answer), m_deadline(deadline) {}

    void receive(const httplib::Response &response, SSL *session) {
        const ResponseBody::Framing framing = framingOf(response);
        m_answer.isFile = m_request.target && response.status == 200 &&
                          response.get_header_value("Content-Type").starts_with("application/octet-stream");
        if (m_answer.isFile) {
            // Without a length a connection that broke would pass for the end of the file.
            if (framing.kind == ResponseBody::Length::UntilClose)
                return;
            m_request.transfer->begin(framing.length);
        }
        ResponseBody body(session, waitOf(m_request), m_answer.isFile ? fileLimit : bodyLimit,
                          [this](const char *bytes, std::size_t length) { return take(bytes, length); });
        m_end = body.read(framing);
    }

    bool isWhole() const { return m_end == ResponseBody::End::Whole; }
    /// The transport's name of what went wrong.
    std::string error() const {
        return httplib::to_string(m_end == ResponseBody::End::Lost ? httplib::Error::Read
                                                                   : httplib::Error::Canceled);
    }

private:
    bool take(const char *bytes, std::size_t length) {
        if (m_answer.isFile)
            return takeOfFile(bytes, length);
        m_answer.body.append(bytes, length);
        return true;
    }

    bool takeOfFile(const char *bytes, std::size_t length) {
        m_received += length;
        m_deadline.restart();
        m_request.transfer->advance(m_received);
        return !m_request.transfer->isCancelled() && m_request.target->write(bytes, length);
    }

    const HttpRequest &m_request;
    HttpResponse &m_answer;
    RequestDeadline &m_deadline;
    std::uint64_t m_received = 0;
    ResponseBody::End m_end = ResponseBody::End::Refused;
};

/// What is to be said of a request without an answer; of a transfer, also to whoever watches it.
HttpResponse failed(const HttpRequest &request, bool timeIsOver, const std::string &error) {
    if (request.target && request.target->hasFailed())
        throw TransferError(TransferFailure::TargetNotWritten, "the target cannot be written",
                            request.target->name());
    HttpResponse answer;
    answer.error = timeIsOver ? "Time is over" : error;
    if (!request.transfer)
        return answer;
    request.transfer->fail(timeIsOver ? TransferFailure::Stalled : TransferFailure::RefusedOrLost);
    if (request.transfer->isCancelled())
        answer.error = "Canceled";
    return answer;
}

/// True unless the transport stopped before the last byte of the request.
bool isSent(const HttpRequest &request, httplib::Error error) {
    switch (error) {
    case httplib::Error::Connection:
    case httplib::Error::ConnectionTimeout:
    case httplib::Error::SSLConnection:
    case httplib::Error::Write:
        return false;
    default:
        return !request.form || request.transfer->bytesDone() >= request.form->length();
    }
}

httplib::Request messageOf(const HttpRequest &request) {
    httplib::Request message;
    message.method = request.verb;
    message.path = request.path;
    message.headers = {{"Content-Type", request.contentType}, {"Authorization", request.authorization}};
    message.body = request.body;
    return message;
}

/// A request of an SSL client from the first to the last byte.
class Exchange {
public:
    explicit Exchange(const HttpRequest &request)
        : m_request(request),
          m_deadline(request.totalTimeout),
          m_key(request.expectedKey),
          m_receiver(request, m_answer, m_deadline) {
        if (request.transfer)
            m_cutOnCancel.emplace(*request.transfer, [this] { m_deadline.cut(); });
    }

    HttpResponse run() {
        // Cancelled before it began, or the program is about to end.
        if (m_deadline.isOver())
            return failed(m_request, true, {});
        const std::unique_ptr<httplib::SSLClient> client = makeClient(m_request);
        if (!client->is_valid())
            return failed(m_request, false, "SSL context");
        configure(*client, m_request, m_deadline);
        m_head.watch(client->ssl_context());
        m_key.watch(client->ssl_context());
        const httplib::Request message = prepared();
        HttpResponse answer = judged(client->send(message));
        answer.serverKey = m_key.presented();
        return answer;
    }

private:
    httplib::Request prepared() {
        httplib::Request message = messageOf(m_request);
        if (m_request.form)
            m_sender.emplace(*m_request.form, *m_request.transfer, m_deadline, m_head).attach(message);
        // The body is read here, within its limits, and not by the transport, which takes this for a refusal.
        message.response_handler = [this](const httplib::Response &response) {
            m_head.lift();
            m_headStatus = response.status;
            m_answer.authorization = response.get_header_value("Authorization");
            if (!m_request.headOnly)
                m_receiver.receive(response, m_head.session());
            return false;
        };
        return message;
    }

    HttpResponse judged(const httplib::Result &result) {
        if (m_key.hasRefused()) {
            HttpResponse answer = failed(m_request, false, "Key changed");
            answer.keyChanged = true;
            return answer;
        }
        if (m_sender)
            m_sender->rethrow();
        if (m_sender && m_sender->refusal() != 0)
            return arrived(m_sender->refusal());
        if (m_headStatus != 0 && (m_request.headOnly || m_receiver.isWhole()))
            return arrived(m_headStatus);
        const std::string error = m_headStatus == 0 ? httplib::to_string(result.error()) : m_receiver.error();
        HttpResponse answer = failed(m_request, m_deadline.isOver(), error);
        answer.wasSent = isSent(m_request, result.error());
        return answer;
    }

    HttpResponse arrived(int status) {
        m_answer.arrived = true;
        m_answer.status = status;
        if (m_request.transfer && status == tooLarge)
            m_request.transfer->fail(TransferFailure::TooLarge);
        return std::move(m_answer);
    }

    const HttpRequest &m_request;
    HttpResponse m_answer;
    RequestDeadline m_deadline;
    std::optional<Transfer::CutOnCancel> m_cutOnCancel;
    ResponseHeaderGuard m_head;
    ServerKeyCheck m_key;
    int m_headStatus = 0; ///< once the head is complete
    Receiver m_receiver;
    std::optional<MultipartStreamer> m_sender;
};

} // namespace

HttpResponse exchangeHttp(const HttpRequest &request) {
    if (request.port == 0 || request.port > 65535)
        return failed(request, false, "Invalid port");
    // Not left to the transport, which would take no host for this computer.
    if (request.host.empty())
        return failed(request, false, httplib::to_string(httplib::Error::Connection));
    return Exchange(request).run();
}
