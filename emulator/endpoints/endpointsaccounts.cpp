#include "http/endpoint.h"
#include "service.h"
#include "simulation/clock.h"
#include "tables/credentials.h"

#include <algorithm>

namespace emulator {

namespace {

std::string newPassword(const Json &body, const char *name) {
    const auto password = plainPassword(textMember(body, name));
    if (!password)
        throw Refusal(Code::Malformed, std::string("\"") + name + "\" does not decipher");
    return *password;
}

std::string accountsText(const std::vector<Account> &accounts, Page page) {
    Json members = Json::array();
    for (std::size_t i = page.start; i < accounts.size() && members.size() < page.count; ++i) {
        members.push_back({{"email", accounts[i].email},
                           {"name", accounts[i].name},
                           {"permi", accounts[i].permission},
                           {"desp", accounts[i].description}});
    }
    return jsonText({{"total_items", accounts.size()}, {"data", members}});
}

Response listAccounts(Service &service, const Call &call) {
    const Page page = pageOf(call.body);
    return Response::secret(
        service.withModel([&](Model &model) { return accountsText(model.accounts.all(), page); }));
}

Response newAccount(Service &service, const Call &call) {
    Account account{filledTextMember(call.body, "email"), optionalText(call.body, "name"),
                    filledTextMember(call.body, "permi"), optionalText(call.body, "desp"),
                    hashPassword(newPassword(call.body, "pass"))};
    service.withModel([&](Model &model) {
        const bool first = model.accounts.isFactoryFresh();
        model.accounts.add(account);
        if (first) {
            // Those sessions belong to the factory account, which is gone.
            model.sessions.closeAll();
        }
        model.log.add(nowMs(), "System", "Audit", "Account created", account.email);
    });
    return {};
}

Response changePassword(Service &service, const Call &call) {
    const std::string email = filledTextMember(call.body, "email");
    const auto old = plainPassword(textMember(call.body, "old"));
    const PasswordHash replacement = hashPassword(newPassword(call.body, "new"));
    const auto account = service.withModel([&](Model &model) { return model.accounts.find(email); });
    if (!account)
        throw Refusal(Code::UnknownId, "no such account");
    if (!old || !passwordMatches(*old, account->password))
        throw Refusal(Code::WrongOldPassword, "the old password is wrong");
    service.withModel([&](Model &model) {
        model.accounts.setPassword(email, replacement);
        model.log.add(nowMs(), "System", "Audit", "Password changed", account->email);
    });
    return {};
}

} // namespace

Endpoints accountEndpoints() {
    return {
        {"POST", "/v1/accm/list", Role::Anyone, &listAccounts},
        {"POST", "/v1/accm/new", Role::Anyone, &newAccount},
        {"POST", "/v1/accm/revpas", Role::Anyone, &changePassword},
    };
}

} // namespace emulator
