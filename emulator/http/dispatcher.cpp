#include "http/dispatcher.h"

#include "service.h"
#include "simulation/clock.h"

#include <unordered_map>

namespace emulator {

namespace {

// The service's clients send JSON under this name, and it takes it under no other.
constexpr std::string_view jsonContentType = "application/x-www-form-urlencoded";

bool isJsonContentType(const std::string &type) {
    return type.starts_with(jsonContentType) &&
           (type.size() == jsonContentType.size() || type[jsonContentType.size()] == ';');
}

void checkContentType(const Request &incoming, Body body) {
    if (body == Body::Form && !incoming.isForm)
        throw Refusal(Code::Malformed, "the body is no form");
    if (body == Body::Text && !isJsonContentType(incoming.contentType))
        throw Refusal(Code::Malformed, "the content type is not " + std::string(jsonContentType));
}

Json bodyOf(const Endpoint &endpoint, const Request &incoming) {
    if (incoming.verb != "POST")
        return Json::object();
    checkContentType(incoming, endpoint.body);
    Json body = parseJson(incoming.body);
    if (!body.is_object())
        throw Refusal(Code::Malformed, "the body is no object");
    return body;
}

/// A request in words, and the member of its body that says how many or which.
struct Deed {
    const char *words;
    const char *member = "";
};

const std::unordered_map<std::string, Deed> &deeds() {
    static const std::unordered_map<std::string, Deed> table = {
        {"/v1/accm/new", {"Account added", "email"}},
        {"/v1/accm/revpas", {"Password of an account changed", "email"}},
        {"/v1/alarm/rm", {"Alarms removed", "alids"}},
        {"/v1/cgi/commit", {"Custom commands changed", "cgis"}},
        {"/v1/dev/auth", {"Devices authorized", "devices"}},
        {"/v1/dev/commit", {"Devices changed", "devices"}},
        {"/v1/dev/scan", {"Search for devices"}},
        {"/v1/dev/scanip", {"Search for devices", "ip"}},
        {"/v1/dev/scanips", {"Search for devices in a range"}},
        {"/v1/dev/setpolicy", {"Password policy set", "devices"}},
        {"/v1/site/new", {"Site added", "sitename"}},
        {"/v1/site/update", {"Site changed", "siteid"}},
        {"/v1/site/rms", {"Site removed", "siteid"}},
        {"/v1/site/commit", {"Sites changed", "sites"}},
        {"/v1/task/rm", {"Tasks removed", "tids"}},
    };
    return table;
}

/// The log's text for a request that was granted; empty for one that changes nothing, and for those whose
/// endpoint writes the log itself.
std::string auditText(const std::string &path, const Json &body) {
    const auto deed = deeds().find(path);
    if (deed == deeds().end())
        return {};
    const auto detail = body.find(deed->second.member);
    if (detail == body.end())
        return deed->second.words;
    return std::string(deed->second.words) + ": " +
           (detail->is_string()  ? detail->get<std::string>()
            : detail->is_array() ? std::to_string(detail->size())
                                 : jsonText(*detail));
}

} // namespace

Dispatcher::Dispatcher(Service &service) : m_service(service) {
    for (const auto &family : {sessionEndpoints(), siteEndpoints(), deviceEndpoints(), accountEndpoints(),
                               taskEndpoints(), alarmEndpoints(), logEndpoints(), commandEndpoints(),
                               operationEndpoints(), configurationEndpoints(), exportEndpoints(),
                               uploadEndpoints(), certificateEndpoints(), orbEndpoints()})
        for (const Endpoint &endpoint : family)
            m_endpoints.emplace(endpoint.path, endpoint);
}

const Endpoint *Dispatcher::find(const std::string &path) const {
    const auto found = m_endpoints.find(path);
    return found == m_endpoints.end() ? nullptr : &found->second;
}

Response Dispatcher::respond(const Endpoint &endpoint, const Request &incoming, bool alwaysRenew) {
    try {
        return granted(endpoint, incoming, alwaysRenew);
    } catch (const Refusal &refusal) {
        return Response::refused(static_cast<int>(refusal.code()), refusal.what());
    }
}

Response Dispatcher::granted(const Endpoint &endpoint, const Request &incoming, bool alwaysRenew) {
    const Call call = callOf(endpoint, incoming);
    Response response = endpoint.handle(m_service, call);
    if (const std::string done = auditText(endpoint.path, call.body); !done.empty()) {
        m_service.withModel(
            [&](Model &model) { model.log.add(nowMs(), "System", "Audit", done, call.session.account); });
    }
    if (endpoint.role != Role::Anyone)
        renewToken(response, incoming.authorization, alwaysRenew);
    return response;
}

Call Dispatcher::callOf(const Endpoint &endpoint, const Request &incoming) {
    Call call;
    call.body = bodyOf(endpoint, incoming);
    call.files = incoming.files;
    if (endpoint.role != Role::Anyone)
        call.session = sessionOf(incoming, call.body, endpoint.role);
    else if (!m_service.genericTokens().accepts(incoming.authorization, nowMs()))
        throw Refusal(Code::NotAccepted, "the token is not accepted");
    return call;
}

SessionToken Dispatcher::sessionOf(const Request &incoming, const Json &body, Role role) {
    const std::string id = textMember(body, "id");
    return m_service.withModel([&](Model &model) {
        const auto session = model.sessions.find(incoming.authorization, nowMs());
        const auto account = session ? model.accounts.find(session->account) : std::nullopt;
        if (!account || !sameEmail(account->email, id))
            throw Refusal(Code::NotAccepted, "no such session");
        if (role == Role::Writer && account->permission == "viewer")
            throw Refusal(Code::NotAllowed, "a viewer changes nothing");
        if (role == Role::Administrator && account->permission != "admin")
            throw Refusal(Code::NotAllowed, "only an administrator may do this");
        return *session;
    });
}

/// Looks the token up again: of requests that came with it at the same time only the first renews it, or the
/// caller could be left with a token that was replaced already.
void Dispatcher::renewToken(Response &response, const std::string &authorization, bool always) {
    m_service.withModel([&](Model &model) {
        const auto token = model.sessions.find(authorization, nowMs());
        if (token && token->isNewest() && (always || Sessions::isDueForRenewal(*token, nowMs())))
            response.token = model.sessions.renew(token->session, nowMs()).value_or(std::string());
    });
}

} // namespace emulator
