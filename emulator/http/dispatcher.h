#pragma once

#include "http/endpoint.h"

#include <string>
#include <unordered_map>
#include <vector>

namespace emulator {

/// A request as it came over the wire.
struct IncomingRequest {
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
    Answer answer(const Endpoint &endpoint, const IncomingRequest &incoming, bool alwaysRenew);

private:
    Answer granted(const Endpoint &endpoint, const IncomingRequest &incoming, bool alwaysRenew);
    Call callOf(const Endpoint &endpoint, const IncomingRequest &incoming);
    SessionToken sessionOf(const IncomingRequest &incoming, const Json &body, Role gate);
    void renewToken(Answer &answer, const std::string &authorization, bool always);

    Service &m_service;
    std::unordered_map<std::string, Endpoint> m_endpoints;
};

} // namespace emulator
