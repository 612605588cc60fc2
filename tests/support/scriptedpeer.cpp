#include "scriptedpeer.h"

#include "platform/crypto/nvlcrypto.h"

#include <QByteArray>
#include <QCryptographicHash>

#include <netinet/in.h>
#include <sys/socket.h>
#include <unistd.h>

#include <openssl/ssl.h>
#include <openssl/x509.h>

#include <algorithm>
#include <cctype>
#include <csignal>
#include <sstream>
#include <stdexcept>
#include <utility>

namespace {

using Session = std::unique_ptr<SSL, decltype(&SSL_free)>;

void require(bool done, const char *what) {
    if (!done)
        throw std::runtime_error(what);
}

/// A certificate for this run; clients of the service do not check it.
void useOwnCertificate(SSL_CTX *context) {
    const std::unique_ptr<EVP_PKEY, decltype(&EVP_PKEY_free)> key(
        EVP_PKEY_Q_keygen(nullptr, nullptr, "EC", "P-256"), &EVP_PKEY_free);
    const std::unique_ptr<X509, decltype(&X509_free)> certificate(X509_new(), &X509_free);
    X509_set_version(certificate.get(), X509_VERSION_3);
    X509_gmtime_adj(X509_getm_notBefore(certificate.get()), 0);
    X509_gmtime_adj(X509_getm_notAfter(certificate.get()), 3600);
    X509_set_pubkey(certificate.get(), key.get());
    require(X509_sign(certificate.get(), key.get(), EVP_sha256()) > 0 &&
                SSL_CTX_use_certificate(context, certificate.get()) == 1 &&
                SSL_CTX_use_PrivateKey(context, key.get()) == 1,
            "certificate");
}

std::string lowered(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(), [](unsigned char c) { return std::tolower(c); });
    return text;
}

ScriptedPeer::Request parsedHead(const std::string &head) {
    ScriptedPeer::Request request;
    std::istringstream lines(head);
    lines >> request.verb >> request.path;
    std::string line;
    std::getline(lines, line);
    while (std::getline(lines, line) && line != "\r") {
        const auto colon = line.find(": ");
        if (colon != std::string::npos)
            request.headers.emplace(lowered(line.substr(0, colon)),
                                    line.substr(colon + 2, line.size() - colon - 3));
    }
    return request;
}

bool readSome(SSL *session, std::string &text) {
    char bytes[16384];
    const int count = SSL_read(session, bytes, sizeof bytes);
    if (count > 0)
        text.append(bytes, static_cast<std::size_t>(count));
    return count > 0;
}

/// Up to the end of the head; a beginning of the body may come with it.
bool readHead(SSL *session, ScriptedPeer::Request &request) {
    std::string text;
    std::size_t headEnd = std::string::npos;
    while ((headEnd = text.find("\r\n\r\n")) == std::string::npos) {
        if (!readSome(session, text)) {
            request.body = text;
            return false;
        }
    }
    request = parsedHead(text.substr(0, headEnd + 4));
    request.body = text.substr(headEnd + 4);
    return true;
}

} // namespace

struct ScriptedPeer::Tls {
    std::unique_ptr<SSL_CTX, decltype(&SSL_CTX_free)> context{SSL_CTX_new(TLS_server_method()),
                                                              &SSL_CTX_free};
};

std::string ScriptedPeer::Request::header(const std::string &name) const {
    return headers.count(name) == 1 ? headers.find(name)->second : std::string();
}

std::string ScriptedPeer::keyFingerprint() {
    const std::lock_guard lock(m_mutex);
    unsigned char *bytes = nullptr;
    const int length = i2d_PUBKEY(SSL_CTX_get0_privatekey(m_tls->context.get()), &bytes);
    const auto key = QByteArray::fromRawData(reinterpret_cast<char *>(bytes), length);
    const QByteArray digest = QCryptographicHash::hash(key, QCryptographicHash::Sha256).toHex();
    OPENSSL_free(bytes);
    return digest.toStdString();
}

void ScriptedPeer::renewKey() {
    const std::lock_guard lock(m_mutex);
    useOwnCertificate(m_tls->context.get());
}

ScriptedPeer::ScriptedPeer() : m_tls(std::make_unique<Tls>()) {
    useOwnCertificate(m_tls->context.get());
    m_listener = ::socket(AF_INET, SOCK_STREAM, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    socklen_t length = sizeof address;
    auto *generic = reinterpret_cast<sockaddr *>(&address);
    require(::bind(m_listener, generic, length) == 0 && ::listen(m_listener, 16) == 0 &&
                ::getsockname(m_listener, generic, &length) == 0,
            "listen");
    m_port = ntohs(address.sin_port);
    m_thread = std::thread([this] { serve(); });
}

ScriptedPeer::~ScriptedPeer() {
    {
        const std::lock_guard lock(m_mutex);
        m_stop = true;
        ::shutdown(m_listener, SHUT_RDWR);
        if (m_socket >= 0)
            ::shutdown(m_socket, SHUT_RDWR);
    }
    m_stopped.notify_all();
    m_thread.join();
    ::close(m_listener);
}

void ScriptedPeer::follow(Script script) {
    const std::lock_guard lock(m_mutex);
    m_script = std::move(script);
}

void ScriptedPeer::answer(const Reply &reply) {
    follow([reply](const Request &) { return reply; });
}

void ScriptedPeer::greet(Greeting greeting) {
    const std::lock_guard lock(m_mutex);
    m_greeting = greeting;
}

void ScriptedPeer::watchBody(std::size_t step, BodyWatcher watcher) {
    const std::lock_guard lock(m_mutex);
    m_bodyStep = step;
    m_bodyWatcher = std::move(watcher);
}

std::vector<ScriptedPeer::Request> ScriptedPeer::takeRequests() {
    const std::lock_guard lock(m_mutex);
    return std::exchange(m_requests, {});
}

std::string ScriptedPeer::http(int status, const std::string &body, const std::vector<std::string> &headers) {
    std::string text = "HTTP/1.1 " + std::to_string(status) + " Status\r\n";
    for (const std::string &header : headers)
        text += header + "\r\n";
    return text + "Content-Length: " + std::to_string(body.size()) + "\r\n\r\n" + body;
}

ScriptedPeer::Reply ScriptedPeer::json(const nlohmann::json &body, const std::vector<std::string> &headers) {
    return {http(200, body.dump(), headers)};
}

ScriptedPeer::Reply ScriptedPeer::sealed(const nlohmann::json &data) {
    const std::string plain = data.dump();
    char *out = nullptr;
    require(dataToCypher(plain.data(), plain.size(), &out) == 0, "cipher");
    const std::string text(out);
    nvlcryptoFree(out);
    return json({{"code", 0}, {"data", text}});
}

void ScriptedPeer::serve() {
    while (true) {
        const int socket = ::accept(m_listener, nullptr, nullptr);
        Greeting greeting{};
        {
            const std::lock_guard lock(m_mutex);
            if (m_stop || socket < 0) {
                ::close(socket);
                break;
            }
            m_socket = socket;
            greeting = m_greeting;
        }
        ++m_connections;
        // Here and not at the start: the test library puts handlers of its own in place when it runs the
        // tests.
        std::signal(SIGPIPE, SIG_IGN);
        if (greeting == Greeting::Handshake || greeting == Greeting::Renegotiate)
            converse(socket, greeting);
        char ignored = 0;
        while (greeting == Greeting::Silence && ::recv(socket, &ignored, 1, 0) > 0) {
        }
        const std::lock_guard lock(m_mutex);
        m_socket = -1;
        ::close(socket);
    }
}

void ScriptedPeer::converse(int socket, Greeting greeting) {
    Session session(nullptr, &SSL_free);
    {
        const std::lock_guard lock(m_mutex);
        session.reset(SSL_new(m_tls->context.get()));
    }
    SSL_set_fd(session.get(), socket);
    const bool renegotiates = greeting == Greeting::Renegotiate;
    if (renegotiates)
        SSL_set_max_proto_version(session.get(), TLS1_2_VERSION);
    Request request;
    if (SSL_accept(session.get()) != 1)
        return;
    if (!readHead(session.get(), request)) {
        m_brokenOffBytes += static_cast<int>(request.body.size());
        return;
    }
    if (!takeBody(session.get(), request))
        return;
    Script script;
    {
        const std::lock_guard lock(m_mutex);
        m_requests.push_back(request);
        script = m_script;
    }
    if (renegotiates && (SSL_renegotiate(session.get()) != 1 || SSL_do_handshake(session.get()) != 1))
        return;
    const Reply reply = script ? script(request) : Reply{};
    const std::size_t piece = reply.piece ? reply.piece : std::max<std::size_t>(reply.bytes.size(), 1);
    for (std::size_t at = 0; at < reply.bytes.size(); at += piece) {
        const std::size_t length = std::min(piece, reply.bytes.size() - at);
        if (!rest(reply.pause) ||
            SSL_write(session.get(), reply.bytes.data() + at, static_cast<int>(length)) <= 0)
            return;
    }
    std::string ignored;
    if (reply.end == End::Hold) {
        while (readSome(session.get(), ignored)) {
        }
    } else if (reply.end == End::Reset) {
        const linger tornDown{1, 0};
        ::setsockopt(socket, SOL_SOCKET, SO_LINGER, &tornDown, sizeof tornDown);
    } else {
        SSL_shutdown(session.get());
    }
}

/// False when the client has gone before the end.
bool ScriptedPeer::takeBody(ssl_st *session, Request &request) {
    std::size_t step = 0;
    BodyWatcher watcher;
    {
        const std::lock_guard lock(m_mutex);
        step = m_bodyStep;
        watcher = m_bodyWatcher;
    }
    const std::string length = request.header("content-length");
    std::size_t next = step;
    while (!length.empty() && request.body.size() < std::stoul(length)) {
        if (!readSome(session, request.body))
            return false;
        for (; watcher && request.body.size() >= next; next += step) {
            if (!watcher(next))
                return true;
        }
    }
    return true;
}

/// False when the peer is to end.
bool ScriptedPeer::rest(std::chrono::milliseconds time) {
    std::unique_lock lock(m_mutex);
    return !m_stopped.wait_for(lock, time, [this] { return m_stop; });
}
