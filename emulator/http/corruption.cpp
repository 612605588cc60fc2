#include "http/corruption.h"

#include "http/answer.h"
#include "http/faults.h"
#include "http/jsonaccess.h"

#include <utility>

namespace emulator {

namespace {

constexpr std::string_view dataMember = R"(,"data":)";

Json otherType(const Json &value);

/// Keeps the containers that hold the members and gives every member another type.
Json membersSpoiled(const Json &value) {
    Json spoiled = value;
    for (Json &element : spoiled)
        element = value.is_array() && element.is_object() ? membersSpoiled(element) : otherType(element);
    return spoiled;
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

void spoilTypes(Answer &answer, const std::string &where) {
    if (answer.data.empty())
        return;
    const Json data = Json::parse(answer.data);
    const bool wholly = where == "data" || !data.is_structured();
    answer.data = jsonText(wholly ? otherType(data) : membersSpoiled(data));
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

std::string spoiledBody(Answer answer, const Fault &fault) {
    if (fault.kind == FaultKind::NotJson)
        return "<html><body>Please sign in to this network.</body></html>";
    if (answer.isFile)
        return std::move(answer.data);
    if (fault.kind == FaultKind::WrongTypes && fault.where != "code")
        spoilTypes(answer, fault.where);
    std::string body = envelope(answer);
    if (fault.kind == FaultKind::WrongTypes && fault.where == "code") {
        const std::string code = std::to_string(answer.code);
        replaceFirst(body, R"("code":)" + code, R"("code":")" + code + '"');
    } else if (fault.kind == FaultKind::NoData) {
        cutData(body);
    } else if (fault.kind == FaultKind::BadCipher) {
        breakCipher(body);
    }
    return body;
}

} // namespace emulator
