#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tables/credentials.h"

namespace emulator {

namespace {

Response isAlive(Service &, const Call &) {
    return {};
}

Response login(Service &service, const Call &call) {
    const std::string email = textMember(call.body, "email");
    const auto password = plainPassword(textMember(call.body, "pass"));
    const auto account = service.withModel([&](Model &model) { return model.accounts.find(email); });
    // The hash is slow on purpose, so it is computed outside of the lock.
    if (!password || !account || !passwordMatches(*password, account->password))
        throw Refusal(Code::NotAccepted, "wrong e-mail or password");
    Response response;
    response.token = service.withModel([&](Model &model) {
        std::string token = model.sessions.open(account->email, nowMs());
        model.log.add(nowMs(), "System", "Audit", "Logged in", account->email);
        return token;
    });
    return response;
}

Response logout(Service &service, const Call &call) {
    service.withModel([&](Model &model) {
        model.sessions.close(call.session.session);
        model.log.add(nowMs(), "System", "Audit", "Logged off", call.session.account);
    });
    return {};
}

Response getSettings(Service &service, const Call &) {
    return Response::secret(service.withModel([](Model &model) { return model.settings.text(); }));
}

Response setSettings(Service &service, const Call &call) {
    service.withModel([&](Model &model) {
        if (const std::string what = model.settings.change(call.body); !what.empty())
            model.log.add(nowMs(), "System", "Audit", "Settings changed: " + what, call.session.account);
        model.log.expire(nowMs(), model.settings.logDays());
    });
    return {};
}

} // namespace

Endpoints sessionEndpoints() {
    return {
        {"GET", "/isalive", Role::Anyone, &isAlive},
        {"POST", "/v1/login", Role::Anyone, &login},
        {"POST", "/v1/logout", Role::Reader, &logout},
        {"POST", "/v1/config/get", Role::Reader, &getSettings},
        {"POST", "/v1/config/set", Role::Writer, &setSettings},
    };
}

} // namespace emulator
