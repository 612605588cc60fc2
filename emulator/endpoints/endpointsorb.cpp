#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tables/credentials.h"

namespace emulator {

namespace {

void note(Model &model, const Call &call, const std::string &what) {
    model.log.add(nowMs(), "System", "Audit", what, call.session.account);
}

Response signIn(Service &service, const Call &call) {
    const std::string email = filledTextMember(call.body, "email");
    const std::string password = plainPassword(filledTextMember(call.body, "login")).value_or("");
    const Orb::User user = service.withModel([&](Model &model) { return model.orb.user(email); });
    // The hash is slow on purpose, so it is computed outside of the lock.
    if (!passwordMatches(password, user.password))
        throw Refusal(Code::NotAccepted, "wrong e-mail or password");
    if (user.expired)
        throw Refusal(Code::NoMoreSessions, "the password has expired");
    service.withModel([&](Model &model) {
        model.orb.signIn(email, nowMs());
        note(model, call, "Signed in to the remote-access service as " + email);
    });
    return {};
}

Response organizations(Service &service, const Call &) {
    return Response::secret(
        service.withModel([](Model &model) { return model.orb.organizationsText(nowMs()); }));
}

Response addService(Service &service, const Call &call) {
    const std::string organization = filledTextMember(call.body, "org_id");
    const std::string site = filledTextMember(call.body, "site_id");
    service.withModel([&](Model &model) {
        model.orb.add(organization, site, nowMs());
        note(model, call, "Remote-access service connected");
    });
    return {};
}

Response disconnect(Service &service, const Call &call) {
    service.withModel([&](Model &model) {
        model.orb.disconnect();
        note(model, call, "Remote-access service disconnected");
    });
    return {};
}

Response cachedStatus(Service &service, const Call &) {
    return Response::secret(service.withModel([](Model &model) { return model.orb.statusText(); }));
}

Response isAdded(Service &service, const Call &) {
    const bool added = service.withModel([](Model &model) { return model.orb.isAdded(); });
    return Response::secret(jsonText({{"is_orb_service_added", added}}));
}

/// The state that holds afterwards travels as an object of its own, shaped like the one in the status.
Response setRemoteAccess(Service &service, const Call &call) {
    const Json &wanted = member(call.body, "enable");
    if (!wanted.is_boolean())
        throw Refusal(Code::Malformed, "\"enable\" is no boolean");
    service.withModel([&](Model &model) {
        model.orb.setRemoteAccess(wanted.get<bool>());
        note(model, call, wanted.get<bool>() ? "Remote access switched on" : "Remote access switched off");
    });
    return Response::secret(jsonText({{"enable", wanted}}));
}

} // namespace

Endpoints orbEndpoints() {
    return {
        {"POST", "/v1/orb/login", Role::Administrator, &signIn},
        {"POST", "/v1/orb/orgs", Role::Administrator, &organizations},
        {"POST", "/v1/orb/add_service", Role::Administrator, &addService},
        {"POST", "/v1/orb/logout_service", Role::Administrator, &disconnect},
        {"POST", "/v1/orb/cache/status", Role::Reader, &cachedStatus},
        {"POST", "/v1/orb/cache/is_service_added", Role::Reader, &isAdded},
        {"POST", "/v1/orb/remote_access", Role::Administrator, &setRemoteAccess},
    };
}

} // namespace emulator
