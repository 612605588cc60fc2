#pragma once

#include <chrono>
#include <cstdint>
#include <string>

class DownloadTarget;
class MultipartBody;
class Transfer;

/// One HTTPS request, as the transport needs it.
struct HttpRequest {
    std::string host;
    std::uint32_t port = 0;
    std::string verb;
    std::string path;
    std::string contentType;
    std::string authorization; ///< the bare value, without a scheme word
    std::string body;
    std::string expectedKey;                  ///< fingerprint of the server's public key; empty to take any
    std::chrono::milliseconds waitTimeout{0}; ///< to connect, and of each read; 0 for the defaults
    std::chrono::milliseconds totalTimeout{60000}; ///< of the whole request; of a transfer without progress
    bool headOnly = false;                         ///< the answer's body is of no interest, nor its fate
    Transfer *transfer = nullptr;                  ///< makes it a transfer, which this one counts and can end
    MultipartBody *form = nullptr;                 ///< of a transfer: sent in place of body
    DownloadTarget *target = nullptr;              ///< of a transfer: takes the answer's body if it is a file
};

/// What came back. Without an answer, error holds the reason's name and nothing else is set
/// but what is known of the server's key.
struct HttpResponse {
    bool arrived = false;
    std::string error;
    std::string serverKey;   ///< fingerprint of the server's public key, once it was seen
    bool keyChanged = false; ///< it is not the expected one, so nothing was sent
    bool wasSent = false;    ///< without an answer: the service may have the whole request all the same
    int status = 0;
    std::string authorization; ///< the answer's header of that name, or empty
    std::string body;
    bool isFile = false; ///< the body went to the request's target, whole

    /// The beginning of the body as it came: a service cannot fill the disk with what is logged of it.
    std::string loggedBody() const { return body.substr(0, 4096); }
};

/// Opens a connection, sends the request, reads the answer (64 MiB of body at most, 4 GiB of a file) and
/// closes. Blocks; any thread whose stack has 64 MiB, which a hostile status line needs. Throws what
/// allocation throws, and for a transfer TransferError; how it failed otherwise is told to the transfer.
HttpResponse exchangeHttp(const HttpRequest &request);
