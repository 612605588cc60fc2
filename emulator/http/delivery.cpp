#include "http/delivery.h"

#include "http/faults.h"
#include "http/jsonaccess.h"
#include "http/response.h"
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

constexpr std::string_view dataMember = R"(,"data":)";

Json otherType(const Json &value);

/// Keeps the containers that hold the members and gives every member another type.
Json withCorruptMembers(const Json &value) {
    Json corrupted = value;
    for (Json &element : corrupted)
        element = value.is_array() && element.is_object() ? withCorruptMembers(element) : otherType(element);
    return corrupted;
}

Json otherType(const Json &value) {
    switch (value.type()) {
    case Json::value_t::string:
        return 42;
    case Json::value_t::array:
        return {{"first", value.empty() ? Json() : value.front()}};
    case Json::value_t::object:
        return Json::array({value});
    case Json::value_t::boolean:
        return "yes";
    default:
        return "a text";
    }
}

void corruptTypes(Response &response, const std::string &where) {
    if (response.data.empty())
        return;
    const Json data = Json::parse(response.data);
    const bool wholly = where == "data" || !data.is_structured();
    response.data = jsonText(wholly ? otherType(data) : withCorruptMembers(data));
}

void replaceFirst(std::string &text, std::string_view what, std::string_view with) {
    if (const auto at = text.find(what); at != std::string::npos)
        text.replace(at, what.size(), with);
}

/// An envelope ends with its data, and a quote within its message is escaped.
void cutData(std::string &body) {
    body.erase(body.find(dataMember));
    body += '}';
}

void breakCipher(std::string &body) {
    const auto start = body.find(std::string(dataMember) + "\"D1:");
    if (start != std::string::npos) {
        char &middle = body[(start + body.size()) / 2];
        middle = middle == 'A' ? 'B' : 'A';
    }
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

std::string corruptedBody(Response response, const Fault &fault) {
    if (fault.kind == FaultKind::NotJson)
        return "<html><body>Please sign in to this network.</body></html>";
    if (response.isFile)
        return std::move(response.data);
    if (fault.kind == FaultKind::WrongTypes && fault.where != "code")
        corruptTypes(response, fault.where);
    std::string body = envelope(response);
    if (fault.kind == FaultKind::WrongTypes && fault.where == "code") {
        const std::string code = std::to_string(response.code);
        replaceFirst(body, R"("code":)" + code, R"("code":")" + code + '"');
    } else if (fault.kind == FaultKind::NoData) {
        cutData(body);
    } else if (fault.kind == FaultKind::BadCipher) {
        breakCipher(body);
    }
    return body;
}

} // namespace emulator
