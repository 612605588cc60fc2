#pragma once

#include "http/jsonaccess.h"
#include "http/response.h"
#include "http/uploadedfile.h"
#include "tables/records.h"

#include <span>
#include <string>
#include <vector>

namespace emulator {

class Service;

/// Who may call an endpoint.
enum class Role {
    Anyone, ///< with a generic token
    Reader, ///< any session
    Writer, ///< a session whose account may change things
    Administrator,
};

/// How the body of a request comes.
enum class Body {
    Text,
    Form, ///< parameters as JSON in the part "text", and files
};

/// A request that its endpoint's role permits.
struct Call {
    Json body;
    std::span<const UploadedFile> files;
    SessionToken session; ///< empty for a request with a generic token
};

/// One path of the service. The handler throws Refusal for a request that it does not grant.
struct Endpoint {
    const char *verb;
    const char *path;
    Role role;
    Response (*handle)(Service &, const Call &);
    Body body = Body::Text;
};

using Endpoints = std::vector<Endpoint>;

/// The families; each has a file of its own.
Endpoints sessionEndpoints();
Endpoints siteEndpoints();
Endpoints deviceEndpoints();
Endpoints accountEndpoints();
Endpoints taskEndpoints();
Endpoints alarmEndpoints();
Endpoints logEndpoints();
Endpoints commandEndpoints();
Endpoints operationEndpoints();
Endpoints configurationEndpoints();
Endpoints exportEndpoints();
Endpoints uploadEndpoints();
Endpoints certificateEndpoints();
Endpoints orbEndpoints();

} // namespace emulator
