#pragma once

#include <nlohmann/json.hpp>

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

using Json = nlohmann::json;

namespace httplib {
struct Request;
}

/// Compares JSON values by their texts: the test library cannot print them, and its comparisons do not
/// compile with a type that converts to everything.
#define COMPARE_JSON(actual, expected) QCOMPARE(Json(actual).dump(), Json(expected).dump())

/// What came back for one request.
struct Reply {
    std::string error;   ///< why no whole response came
    int status = 0;      ///< HTTP status, 0 where no whole response came
    int code = -1;       ///< "code", -1 where the body has no such integer
    bool secret = false; ///< "data" came ciphered
    Json body;           ///< the body as JSON, discarded where it is none
    Json data;           ///< "data", deciphered where it was ciphered; null where it does not decipher
    std::string token;   ///< a token in the header
    std::string contentType;
    std::string bytes; ///< the body as it came
};

/// Speaks to the service as any caller may: plain HTTPS and the ciphers.
class ServiceCaller {
public:
    explicit ServiceCaller(int port) : m_port(port) {}

    static std::string genericToken();
    static std::string cipheredPassword(const std::string &password);

    struct Request {
        std::string verb = "POST";
        std::string path;
        std::string body;
        std::string token;
        std::string contentType = "application/x-www-form-urlencoded";
    };
    Reply send(const Request &request) const;

    /// A request without a session.
    Reply post(const std::string &path, const Json &body) const;

    /// Logs in; the session is used by call from then on.
    Reply login(const std::string &email, const std::string &password);
    /// A request of the session, with its "id" added; a renewed token is taken over.
    Reply call(const std::string &path, Json body = Json::object());

    /// A file of a form.
    struct File {
        std::string part;
        std::string name;
        std::string content;
    };
    /// A form of the session, with its "id" added to the parameters.
    Reply sendForm(const std::string &path, Json parameters, const std::vector<File> &files) const;

    /// All pages of a list.
    Json list(const std::string &path, int pageSize = 500);

    std::string token() const { return m_token; }
    void setToken(const std::string &token) { m_token = token; }
    void setReadTimeout(int seconds) { m_readTimeout = seconds; }

private:
    Reply send(httplib::Request raw) const;

    int m_port;
    int m_readTimeout = 30;
    std::string m_account;
    std::string m_token;
};
