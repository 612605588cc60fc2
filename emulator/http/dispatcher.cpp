#include "http/dispatcher.h"

#include "http/audit.h"
#include "service.h"
#include "simulation/clock.h"

namespace emulator {

namespace {

// The service's clients send JSON under this name, and it takes it under no other.
constexpr std::string_view jsonContentType = "application/x-www-form-urlencoded";

bool isJsonContentType(const std::string &type) {
    return type.starts_with(jsonContentType) &&
           (type.size() == jsonContentType.size() || type[jsonContentType.size()] == ';');
}

void checkContentType(const IncomingRequest &incoming, Body body) {
    if (body == Body::Form && !incoming.isForm)
        throw Refusal(Code::Malformed, "the body is no form");
    if (body == Body::Text && !isJsonContentType(incoming.contentType))
        throw Refusal(Code::Malformed, "the content type is not " + std::string(jsonContentType));
}

Json bodyOf(const Endpoint &endpoint, const IncomingRequest &incoming) {
    if (incoming.verb != "POST")
        return Json::object();
    checkContentType(incoming, endpoint.body);
    Json body = parseJson(incoming.body);
    if (!body.is_object())
        throw Refusal(Code::Malformed, "the body is no object");
    return body;
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

Answer Dispatcher::answer(const Endpoint &endpoint, const IncomingRequest &incoming, bool alwaysRenew) {
    try {
        return granted(endpoint, incoming, alwaysRenew);
    } catch (const Refusal &refusal) {
        return Answer::refused(static_cast<int>(refusal.code()), refusal.what());
    }
}

Answer Dispatcher::granted(const Endpoint &endpoint, const IncomingRequest &incoming, bool alwaysRenew) {
    const Call call = callOf(endpoint, incoming);
    Answer answer = endpoint.handle(m_service, call);
    if (const std::string done = auditText(endpoint.path, call.body); !done.empty()) {
        m_service.withModel(
            [&](Model &model) { model.log.add(nowMs(), "System", "Audit", done, call.session.account); });
    }
    if (endpoint.gate != Role::Anybody)
        renewToken(answer, incoming.authorization, alwaysRenew);
    return answer;
}

Call Dispatcher::callOf(const Endpoint &endpoint, const IncomingRequest &incoming) {
    Call call;
    call.body = bodyOf(endpoint, incoming);
    call.files = incoming.files;
    if (endpoint.gate != Role::Anybody)
        call.session = sessionOf(incoming, call.body, endpoint.gate);
    else if (!m_service.genericTokens().accepts(incoming.authorization, nowMs()))
        throw Refusal(Code::NotAccepted, "the token is not accepted");
    return call;
}

SessionToken Dispatcher::sessionOf(const IncomingRequest &incoming, const Json &body, Role gate) {
    const std::string id = textMember(body, "id");
    return m_service.withModel([&](Model &model) {
        const auto session = model.sessions.find(incoming.authorization, nowMs());
        const auto account = session ? model.accounts.find(session->account) : std::nullopt;
        if (!account || !sameEmail(account->email, id))
            throw Refusal(Code::NotAccepted, "no such session");
        if (gate == Role::Writer && account->permission == "viewer")
            throw Refusal(Code::NotAllowed, "a viewer changes nothing");
        if (gate == Role::Administrator && account->permission != "admin")
            throw Refusal(Code::NotAllowed, "only an administrator may do this");
        return *session;
    });
}

/// Looks the token up anew: of requests that came with it at the same time only the first renews it, or the
/// caller could be left with a token that was replaced already.
void Dispatcher::renewToken(Answer &answer, const std::string &authorization, bool always) {
    m_service.withModel([&](Model &model) {
        const auto token = model.sessions.find(authorization, nowMs());
        if (token && token->isNewest() && (always || Sessions::isDueForRenewal(*token, nowMs())))
            answer.token = model.sessions.renew(token->session, nowMs()).value_or(std::string());
    });
}

} // namespace emulator
