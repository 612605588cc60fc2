#include "http/answer.h"

#include "tables/credentials.h"

#include <nlohmann/json.hpp>

#include <utility>

namespace emulator {

Answer Answer::plain(std::string data) {
    Answer answer;
    answer.data = std::move(data);
    return answer;
}

Answer Answer::secret(std::string data) {
    Answer answer = plain(std::move(data));
    answer.ciphered = true;
    return answer;
}

Answer Answer::file(std::string bytes) {
    Answer answer = plain(std::move(bytes));
    answer.isFile = true;
    return answer;
}

Answer Answer::refused(int code, std::string why) {
    Answer answer;
    answer.code = code;
    answer.msg = std::move(why);
    return answer;
}

std::string envelope(const Answer &answer) {
    const nlohmann::json msg = answer.msg;
    std::string text = R"({"code":)" + std::to_string(answer.code) + R"(,"msg":)" +
                       msg.dump(-1, ' ', false, nlohmann::json::error_handler_t::replace) + R"(,"data":)";
    if (answer.data.empty()) {
        text += "null";
    } else if (answer.ciphered) {
        // The alphabet of a cipher text needs no escaping.
        text += '"' + cipheredData(answer.data) + '"';
    } else {
        text += answer.data;
    }
    return text + '}';
}

} // namespace emulator
