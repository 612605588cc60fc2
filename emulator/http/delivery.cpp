#include "http/delivery.h"

#include "platform.h"
#include "stopsignal.h"

#include <httplib.h>

#include <openssl/ssl.h>

#include <memory>
#include <thread>
#include <utility>

namespace emulator {

namespace {

using platform::cutConnection;
using std::chrono::milliseconds;

int socketOf(const httplib::Request &request) {
    return request.ssl ? SSL_get_fd(request.ssl) : -1;
}

/// Announces the whole body, sends a part of it and resets the connection.
void deliverPart(const httplib::Request &request, httplib::Response &response, std::string body,
                 std::size_t count, const char *type) {
    const int descriptor = socketOf(request);
    const auto kept = std::make_shared<std::string>(std::move(body));
    response.set_content_provider(
        kept->size(), type, [kept, count, descriptor](std::size_t, std::size_t, httplib::DataSink &sink) {
            sink.write(kept->data(), count);
            // What has arrived should be seen before the reset overtakes it.
            std::this_thread::sleep_for(milliseconds(50));
            cutConnection(descriptor);
            return false;
        });
}

} // namespace

void holdUnanswered(const httplib::Request &request, const StopSignal &stop) {
    const int descriptor = socketOf(request);
    while (!platform::callerHasLeft(descriptor) && !stop.waitFor(milliseconds(100))) {
    }
    cutConnection(descriptor);
}

void deliverHalf(const httplib::Request &request, httplib::Response &response, std::string body,
                 const char *type) {
    const std::size_t half = body.size() / 2;
    deliverPart(request, response, std::move(body), half, type);
}

void deliverAndCut(const httplib::Request &request, httplib::Response &response, std::string body,
                   const char *type) {
    const std::size_t all = body.size();
    deliverPart(request, response, std::move(body), all, type);
}

void cutConnectionOf(const httplib::Request &request) {
    cutConnection(socketOf(request));
}

void deliverDripping(httplib::Response &response, std::string body, const char *type,
                     const StopSignal &stop) {
    const auto kept = std::make_shared<std::string>(std::move(body));
    response.set_content_provider(
        kept->size(), type, [kept, &stop](std::size_t offset, std::size_t, httplib::DataSink &sink) {
            return sink.write(kept->data() + offset, 1) && !stop.waitFor(milliseconds(1000));
        });
}

} // namespace emulator
