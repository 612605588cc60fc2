#pragma once

#include "http/endpoint.h"
#include "http/jsonaccess.h"

#include <string>
#include <unordered_map>
#include <vector>

namespace emulator {

/// A request as it came over the wire.
struct Request {
    std::string verb;
    std::string path;
    std::string authorization;
    std::string contentType;
    std::string body; ///< of a form its parameters
    bool isForm = false;
    std::vector<UploadedFile> files;
};

/// Finds the endpoint of a request, judges the request and lets the endpoint answer it.
class Dispatcher {
public:
    explicit Dispatcher(Service &service);

    /// Null for a path that the service does not have.
    const Endpoint *find(const std::string &path) const;

    /// Never throws for what a caller did; an exception is a defect.
    Response respond(const Endpoint &endpoint, const Request &incoming, bool alwaysRenew);

private:
    Response granted(const Endpoint &endpoint, const Request &incoming, bool alwaysRenew);
    Call callOf(const Endpoint &endpoint, const Request &incoming);
    SessionToken sessionOf(const Request &incoming, const Json &body, Role role);
    void renewToken(Response &response, const std::string &authorization, bool always);

    Service &m_service;
    std::unordered_map<std::string, Endpoint> m_endpoints;
};

} // namespace emulator
