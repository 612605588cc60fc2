#include "http/response.h"

#include "tables/credentials.h"

#include <nlohmann/json.hpp>

#include <utility>

namespace emulator {

Response Response::plain(std::string data) {
    Response response;
    response.data = std::move(data);
    return response;
}

Response Response::secret(std::string data) {
    Response response = plain(std::move(data));
    response.ciphered = true;
    return response;
}

Response Response::file(std::string bytes) {
    Response response = plain(std::move(bytes));
    response.isFile = true;
    return response;
}

Response Response::refused(int code, std::string why) {
    Response response;
    response.code = code;
    response.msg = std::move(why);
    return response;
}

std::string envelope(const Response &response) {
    const nlohmann::json msg = response.msg;
    std::string text = R"({"code":)" + std::to_string(response.code) + R"(,"msg":)" +
                       msg.dump(-1, ' ', false, nlohmann::json::error_handler_t::replace) + R"(,"data":)";
    if (response.data.empty()) {
        text += "null";
    } else if (response.ciphered) {
        // The alphabet of a cipher text needs no escaping.
        text += '"' + cipheredData(response.data) + '"';
    } else {
        text += response.data;
    }
    return text + '}';
}

} // namespace emulator
