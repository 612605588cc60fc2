#include "http/httpsserver.h"

#include "http/delivery.h"
#include "http/dispatcher.h"
#include "http/faults.h"
#include "platform.h"
#include "service.h"
#include "stopsignal.h"

#include <httplib.h>

#include <iostream>
#include <stdexcept>
#include <thread>
#include <utility>

namespace emulator {

namespace {

// Requests that are held without a response keep their thread.
constexpr std::size_t threads = 64;
constexpr auto jsonType = "application/json";
constexpr auto fileType = "application/octet-stream";
constexpr auto plainType = "text/plain";

void fail(httplib::Response &response, int status, const std::string &why) {
    response.status = status;
    response.set_content(why + "\n", plainType);
}

void configure(httplib::SSLServer &server) {
    SSL_CTX_set_min_proto_version(server.ssl_context(), TLS1_2_VERSION);
    // Callers come back with a fresh connection each time; unread tickets would only disturb
    // the close of a connection.
    SSL_CTX_set_num_tickets(server.ssl_context(), 0);
    // The library would share the port with another server that asks for it; only a port whose last
    // connections are still dying may be taken again.
    server.set_socket_options(
        [](socket_t descriptor) { platform::reclaimPort(static_cast<std::intptr_t>(descriptor)); });
    server.new_task_queue = [] { return new httplib::ThreadPool(threads); };
    server.set_tcp_nodelay(true);
    server.set_keep_alive_timeout(2);
    server.set_read_timeout(30);
    server.set_write_timeout(30);
}

void logDefect(const httplib::Request &request, const std::exception_ptr &defect) {
    try {
        std::rethrow_exception(defect);
    } catch (const std::exception &error) {
        std::cerr << "nvldm-emulator: " + request.path + " failed: " + error.what() + "\n";
    } catch (...) {
        std::cerr << "nvldm-emulator: " + request.path + " failed\n";
    }
}

} // namespace

HttpsServer::HttpsServer(Service &service, Faults &faults, const StopSignal &stop, const ServerRules &rules,
                         ServerIdentity identity)
    : m_service(service),
      m_faults(faults),
      m_stop(stop),
      m_latencyMs(rules.latencyMs),
      m_limits(rules.limits),
      m_identity(std::move(identity)),
      m_dispatcher(std::make_unique<Dispatcher>(service)),
      m_server(std::make_unique<httplib::SSLServer>(m_identity.certificate.get(), m_identity.key.get())) {
    if (!m_server->is_valid())
        throw std::runtime_error("the HTTPS server cannot be set up");
    configure(*m_server);
    route();
}

HttpsServer::~HttpsServer() = default;

int HttpsServer::bind(const std::string &host, int port, int lastPort) {
    const bool any = port == 0;
    // A running client looks for the service where it was.
    if (const int wanted = any ? lastPort : port; wanted != 0 && m_server->bind_to_port(host, wanted))
        return wanted;
    const int bound = any ? m_server->bind_to_any_port(host) : -1;
    if (bound <= 0)
        throw std::runtime_error("cannot listen on " + host + ":" + std::to_string(port));
    return bound;
}

void HttpsServer::serve() {
    m_server->listen_after_bind();
}

void HttpsServer::waitUntilServing() const {
    while (!m_server->is_running())
        std::this_thread::sleep_for(std::chrono::milliseconds(1));
}

void HttpsServer::stop() {
    m_server->stop();
}

void HttpsServer::route() {
    const auto withoutBody = [this](const httplib::Request &request, httplib::Response &response) {
        handle(request, response, nullptr);
    };
    // Only a handler that reads the body itself gets a long one: the library holds bodies of this content
    // type to eight kilobytes otherwise.
    const auto withBody = [this](const httplib::Request &request, httplib::Response &response,
                                 const httplib::ContentReader &reader) {
        handle(request, response, &reader);
    };
    m_server->Get(".*", withoutBody);
    m_server->Options(".*", withoutBody);
    m_server->Post(".*", withBody);
    m_server->Put(".*", withBody);
    m_server->Patch(".*", withBody);
    m_server->Delete(".*", withBody);
    m_server->set_exception_handler(
        [](const httplib::Request &request, httplib::Response &response, const std::exception_ptr &defect) {
            logDefect(request, defect);
            fail(response, 500, "internal error");
        });
}

void HttpsServer::handle(const httplib::Request &request, httplib::Response &response,
                         const httplib::ContentReader *reader) {
    Request incoming;
    incoming.verb = request.method;
    incoming.path = request.path;
    incoming.authorization = request.get_header_value("Authorization");
    incoming.contentType = request.get_header_value("Content-Type");
    const FaultPlan plan = m_faults.planFor(incoming.path);
    if (plan.main && plan.main->kind == FaultKind::Early) {
        response.status = plan.main->number;
        return deliverAndCut(request, response, envelope({}), jsonType);
    }
    std::optional<WorkArrival> arrival;
    switch (reader ? readBody(request, *reader, incoming, plan, arrival) : BodyIntake::Result::Whole) {
    case BodyIntake::Result::TooLong:
        return fail(response, 413, "the body is too long");
    case BodyIntake::Result::Broken:
        return fail(response, 400, "the body is incomplete");
    case BodyIntake::Result::Whole:
        judge(request, response, incoming, plan);
    }
}

BodyIntake::Result HttpsServer::readBody(const httplib::Request &request,
                                         const httplib::ContentReader &reader, Request &incoming,
                                         const FaultPlan &plan, std::optional<WorkArrival> &arrival) {
    using Clock = std::chrono::steady_clock;
    const auto start = Clock::now();
    const bool cuts = plan.main && plan.main->kind == FaultKind::CutBody;
    const auto max = cuts ? static_cast<std::uint64_t>(plan.main->number) : UINT64_MAX;
    std::uint64_t size = 0;
    const auto watch = [&](std::size_t count) {
        size += count;
        if (size >= max) {
            cutConnectionOf(request);
            return false;
        }
        const auto due =
            std::chrono::milliseconds(plan.bodyRate == 0 ? 0 : size / 1024 * 1000 / plan.bodyRate);
        const auto early = std::chrono::ceil<std::chrono::milliseconds>(start + due - Clock::now());
        return early.count() <= 0 || !m_stop.waitFor(early);
    };
    const Endpoint *endpoint = m_dispatcher->find(incoming.path);
    const bool isForm = endpoint && endpoint->body == Body::Form && request.is_multipart_form_data();
    BodyIntake intake(incoming, m_limits, watch);
    intake.setOnParameters([&] { arrival.emplace(m_service, incoming); });
    return isForm ? intake.readForm(reader) : intake.readText(reader);
}

void HttpsServer::judge(const httplib::Request &request, httplib::Response &response, const Request &incoming,
                        const FaultPlan &plan) {
    const int delay = m_latencyMs + plan.lateMs;
    if (delay > 0 && m_stop.waitFor(std::chrono::milliseconds(delay)))
        return fail(response, 503, "the service stops");
    if (plan.expire)
        m_service.withModel([](Model &model) { model.sessions.closeAll(); });
    if (plan.main && plan.main->kind == FaultKind::NoResponse)
        return holdUnanswered(request, m_stop);
    if (plan.main && plan.main->kind == FaultKind::Status) {
        response.status = plan.main->number;
        return response.set_content(envelope({}), jsonType);
    }
    const Endpoint *endpoint = m_dispatcher->find(incoming.path);
    if (!endpoint)
        return fail(response, 404, "no such path");
    if (endpoint->verb != incoming.verb) {
        response.set_header("Allow", endpoint->verb);
        return fail(response, 405, "no such verb here");
    }
    respond(request, response, incoming, plan);
}

void HttpsServer::respond(const httplib::Request &request, httplib::Response &response,
                          const Request &incoming, const FaultPlan &plan) {
    if (plan.main && plan.main->kind == FaultKind::ResponseCode)
        return response.set_content(envelope(Response::refused(plan.main->number, "fault")), jsonType);
    Response result = m_dispatcher->respond(*m_dispatcher->find(incoming.path), incoming, plan.renew);
    if (!result.token.empty())
        response.set_header("Authorization", result.token);
    const char *type = result.isFile ? fileType : jsonType;
    std::string body = plan.main       ? corruptedBody(std::move(result), *plan.main)
                       : result.isFile ? std::move(result.data)
                                       : envelope(result);
    if (plan.main && plan.main->kind == FaultKind::Reset)
        deliverHalf(request, response, std::move(body), type);
    else if (plan.main && plan.main->kind == FaultKind::Drip)
        deliverDripping(response, std::move(body), type, m_stop);
    else
        response.set_content(std::move(body), type);
}

} // namespace emulator
