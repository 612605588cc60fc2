#pragma once

#include "http/answer.h"
#include "http/jsonaccess.h"
#include "http/uploadedfile.h"
#include "tables/records.h"

#include <span>
#include <string>
#include <vector>

namespace emulator {

class Service;

/// Who may call an endpoint.
enum class Role {
    Anybody, ///< with a generic token
    Reader,  ///< any session
    Writer,  ///< a session whose account may change things
    Administrator,
};

/// How the body of a request comes.
enum class Body {
    Text,
    Form, ///< parameters as JSON in the part "text", and files
};

/// A request that has passed its gate.
struct Call {
    Json body;
    std::span<const UploadedFile> files;
    SessionToken session; ///< empty at the gate for anybody
};

/// One path of the service. The handler throws Refusal for a request that it does not grant.
struct Endpoint {
    const char *verb;
    const char *path;
    Role gate;
    Answer (*handle)(Service &, const Call &);
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
