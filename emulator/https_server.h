#pragma once

#include "certificate.h"

#include <functional>
#include <memory>
#include <string>

namespace httplib {
class SSLServer;
struct Request;
struct Response;
} // namespace httplib

namespace emulator {

class Dispatcher;
class Faults;
class Service;
class StopSignal;
struct FaultPlan;
struct Incoming;

/// Takes requests over HTTPS and answers them, badly where a fault says so.
class HttpsServer {
public:
    HttpsServer(Service &service, Faults &faults, const StopSignal &stop, int latencyMs);
    ~HttpsServer();

    /// Listens on the port; for 0 on the last one if it is still free, or on any. Gives the port; throws
    /// std::runtime_error when the address cannot be had.
    int bind(const std::string &host, int port, int lastPort);
    /// Serves until stop.
    void serve();
    /// To be called before stop, which the library does not notice while it is still starting.
    void waitUntilServing() const;
    void stop();

private:
    using BodyReader = std::function<bool(const std::function<bool(const char *, std::size_t)> &)>;

    void route();
    void handle(const httplib::Request &request, httplib::Response &response, const BodyReader &readBody);
    void judge(const httplib::Request &request, httplib::Response &response, const Incoming &incoming);
    void answer(const httplib::Request &request, httplib::Response &response, const Incoming &incoming,
                const FaultPlan &plan);

    Service &m_service;
    Faults &m_faults;
    const StopSignal &m_stop;
    int m_latencyMs;
    ServerIdentity m_identity;
    std::unique_ptr<Dispatcher> m_dispatcher;
    std::unique_ptr<httplib::SSLServer> m_server;
};

} // namespace emulator
