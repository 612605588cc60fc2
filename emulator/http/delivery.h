#pragma once

#include <string>

namespace httplib {
struct Request;
struct Response;
} // namespace httplib

namespace emulator {

class StopSignal;

/// The ways to deliver a body badly. The stop signal must outlive the answer.

/// Holds the request without an answer until its caller leaves or the program stops.
void holdUnanswered(const httplib::Request &request, const StopSignal &stop);

/// Announces the whole body, sends half of it and resets the connection.
void deliverHalf(const httplib::Request &request, httplib::Response &response, std::string body,
                 const char *type);

/// Sends the whole body and resets the connection, whatever is still to be read from it.
void deliverAndCut(const httplib::Request &request, httplib::Response &response, std::string body,
                   const char *type);

/// Resets the connection of a request.
void cutConnectionOf(const httplib::Request &request);

/// Sends a byte a second.
void deliverDripping(httplib::Response &response, std::string body, const char *type, const StopSignal &stop);

} // namespace emulator
