#pragma once

#include <stdexcept>
#include <string>

namespace emulator {

/// The codes of a response, apart from 0.
enum class Code {
    Malformed = 3,
    UnknownId = 4,
    NotAllowed = 5,
    NotAccepted = 105,
    WrongOldPassword = 106,
    EmailTaken = 107,
    NoMoreSessions = 108, ///< of the remote-access login: the password has expired
    UnknownRemoteUser = 110,
    NoDeviceResponse = 111, ///< a device is away or does not let the service in
};

/// Thrown wherever a request is found wanting; becomes the response's code.
class Refusal : public std::runtime_error {
public:
    Refusal(Code code, const std::string &why) : std::runtime_error(why), m_code(code) {}

    Code code() const { return m_code; }

private:
    Code m_code;
};

/// What an endpoint answers, before it is put on the wire.
struct Response {
    int code = 0;
    std::string msg = "ok";
    std::string data;      ///< JSON text; empty for none
    bool ciphered = false; ///< data travels as one ciphered text
    bool isFile = false;   ///< data are the bytes of a file, which travel alone
    std::string token;     ///< a session token for the "Authorization" header; empty for none

    static Response plain(std::string data);
    static Response secret(std::string data);
    static Response file(std::string bytes);
    static Response refused(int code, std::string why);
};

/// The body of a response: the envelope with its data, ciphered where it must be. Throws std::runtime_error
/// when the cipher fails.
std::string envelope(const Response &response);

} // namespace emulator
