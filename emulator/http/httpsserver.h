#pragma once

#include "http/bodyintake.h"
#include "http/certificate.h"
#include "tasks/taskwork.h"

#include <memory>
#include <optional>
#include <string>

namespace httplib {
class ContentReader;
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
struct Request;

/// Settings of the server that hold for every request.
struct ServerRules {
    int latencyMs = 0; ///< added to each response
    BodyLimits limits;
};

/// Takes requests over HTTPS and answers them, badly where a fault says so.
class HttpsServer {
public:
    HttpsServer(Service &service, Faults &faults, const StopSignal &stop, const ServerRules &rules,
                ServerIdentity identity);
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
    void route();
    /// A request without a body comes without a reader.
    void handle(const httplib::Request &request, httplib::Response &response,
                const httplib::ContentReader *reader);
    BodyIntake::Result readBody(const httplib::Request &request, const httplib::ContentReader &reader,
                                Request &incoming, const FaultPlan &plan,
                                std::optional<WorkArrival> &arrival);
    void judge(const httplib::Request &request, httplib::Response &response, const Request &incoming,
               const FaultPlan &plan);
    void respond(const httplib::Request &request, httplib::Response &response, const Request &incoming,
                 const FaultPlan &plan);

    Service &m_service;
    Faults &m_faults;
    const StopSignal &m_stop;
    int m_latencyMs;
    BodyLimits m_limits;
    ServerIdentity m_identity;
    std::unique_ptr<Dispatcher> m_dispatcher;
    std::unique_ptr<httplib::SSLServer> m_server;
};

} // namespace emulator
