#pragma once

#include <string>

namespace httplib {
struct Request;
struct Response;
} // namespace httplib

namespace emulator {

class StopSignal;
struct Response;
struct Fault;

/// The ways to deliver a body badly. The stop signal must outlive the response.

/// Holds the request without a response until its caller leaves or the program stops.
void holdUnanswered(const httplib::Request &request, const StopSignal &stop);

/// Announces the whole body, sends half of it and resets the connection.
void deliverHalf(const httplib::Request &request, httplib::Response &response, std::string body,
                 const char *type);

/// Sends the whole body and resets the connection without reading the rest of the request.
void deliverAndCut(const httplib::Request &request, httplib::Response &response, std::string body,
                   const char *type);

/// Resets the connection of a request.
void cutConnectionOf(const httplib::Request &request);

/// Sends a byte a second.
void deliverDripping(httplib::Response &response, std::string body, const char *type, const StopSignal &stop);

/// The body of a response as a fault that changes bodies makes it; unchanged for the other kinds.
std::string corruptedBody(Response response, const Fault &fault);

} // namespace emulator
