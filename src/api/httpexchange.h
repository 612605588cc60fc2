#pragma once

#include <chrono>
#include <cstdint>
#include <string>

/// One HTTPS request, as the transport needs it.
struct HttpRequest {
    std::string host;
    std::uint32_t port = 0;
    std::string verb;
    std::string path;
    std::string contentType;
    std::string authorization; ///< the bare value, without a scheme word
    std::string body;
    std::chrono::milliseconds waitTimeout{0};      ///< to connect, and of each read; 0 for the defaults
    std::chrono::milliseconds totalTimeout{60000}; ///< of the whole request
};

/// What came back. Without an answer, error holds the reason's name and nothing else is set.
struct HttpAnswer {
    bool arrived = false;
    std::string error;
    int status = 0;
    std::string authorization; ///< the answer's header of that name, or empty
    std::string body;
};

/// Opens a connection, sends the request, reads the answer (64 MiB of body at most) and closes. Blocks; any
/// thread whose stack has 64 MiB, which a hostile status line needs. Throws only what allocation throws.
HttpAnswer exchangeHttp(const HttpRequest &request);
