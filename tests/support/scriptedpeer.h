#pragma once

#include <nlohmann/json.hpp>

#include <atomic>
#include <chrono>
#include <condition_variable>
#include <functional>
#include <map>
#include <memory>
#include <mutex>
#include <string>
#include <thread>
#include <vector>

struct ssl_st;

/// A TLS server on a free port of the loopback address that answers as no sane service would: raw bytes, in
/// pieces, late, or never. One connection at a time, one request a connection.
class ScriptedPeer {
public:
    struct Request {
        std::string verb;
        std::string path;
        std::multimap<std::string, std::string> headers; ///< names in lower case
        std::string body;

        /// The only header of that name; empty when there is none or more than one.
        std::string header(const std::string &name) const;
        nlohmann::json json() const { return nlohmann::json::parse(body, nullptr, false); }
    };

    enum class End {
        Close, ///< in order
        Reset, ///< the connection is torn down
        Hold   ///< nothing more comes until the client goes
    };

    struct Reply {
        std::string bytes;
        End end = End::Close;
        std::size_t piece = 0;              ///< bytes of a piece, 0 for all at once
        std::chrono::milliseconds pause{0}; ///< before each piece
    };

    using Script = std::function<Reply(const Request &)>;

    ScriptedPeer();
    ~ScriptedPeer();
    ScriptedPeer(const ScriptedPeer &) = delete;
    ScriptedPeer &operator=(const ScriptedPeer &) = delete;

    std::uint32_t port() const { return m_port; }

    /// SHA-256 of the public key that it shows, in lower case hex.
    std::string keyFingerprint();
    /// Shows another key from the next connection on.
    void renewKey();

    /// What it does from the next request on. The script runs in the peer's thread.
    void follow(Script script);
    void answer(const Reply &reply);
    enum class Greeting {
        Handshake,
        HangUp,     ///< the connection is closed before the handshake
        Silence,    ///< the handshake is never answered
        Renegotiate ///< a handshake of TLS 1.2, and another one is asked for before the answer
    };
    /// How it meets every connection from the next one on.
    void greet(Greeting greeting);

    /// Told how much of a body has come, whenever another step of it has; false lets the rest lie, so that
    /// the peer answers at once. Runs in the peer's thread.
    using BodyWatcher = std::function<bool(std::size_t received)>;
    void watchBody(std::size_t step, BodyWatcher watcher);

    /// The requests since the last call.
    std::vector<Request> takeRequests();
    /// Connections since the start, also those without a request.
    int connections() const { return m_connections; }
    /// Bytes of requests whose head did not come whole.
    int brokenOffBytes() const { return m_brokenOffBytes; }

    /// A whole HTTP answer with its length; headers are whole lines without their ends.
    static std::string http(int status, const std::string &body,
                            const std::vector<std::string> &headers = {});
    /// An answer of the service: status 200 and the JSON.
    static Reply json(const nlohmann::json &body, const std::vector<std::string> &headers = {});
    /// The same with code 0 and ciphered data.
    static Reply sealed(const nlohmann::json &data);

private:
    struct Tls;

    void serve();
    void converse(int socket, Greeting greeting);
    bool takeBody(ssl_st *session, Request &request);
    bool rest(std::chrono::milliseconds time);

    std::unique_ptr<Tls> m_tls;
    int m_listener = -1;
    std::uint32_t m_port = 0;
    std::atomic<int> m_connections = 0;
    std::atomic<int> m_brokenOffBytes = 0;
    std::mutex m_mutex;
    std::condition_variable m_stopped;
    bool m_stop = false;
    Greeting m_greeting = Greeting::Handshake;
    int m_socket = -1;
    Script m_script;
    std::size_t m_bodyStep = 0;
    BodyWatcher m_bodyWatcher;
    std::vector<Request> m_requests;
    std::thread m_thread;
};
