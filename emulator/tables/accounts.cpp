#include "tables/accounts.h"

#include "http/response.h"
#include "tables/store.h"

#include <algorithm>
#include <utility>

namespace emulator {

namespace {

constexpr auto factoryEmail = "admin";

char lower(char c) {
    return c >= 'A' && c <= 'Z' ? static_cast<char>(c | 0x20) : c;
}

bool isPermission(const std::string &permission) {
    return permission == "admin" || permission == "operator" || permission == "viewer";
}

} // namespace

bool sameEmail(const std::string &left, const std::string &right) {
    return std::equal(left.begin(), left.end(), right.begin(), right.end(),
                      [](char a, char b) { return lower(a) == lower(b); });
}

Accounts::Accounts(Store &store) : m_store(store), m_accounts(store.accounts()) {}

std::optional<Account> Accounts::find(const std::string &email) const {
    const auto found = std::find_if(m_accounts.begin(), m_accounts.end(),
                                    [&](const Account &account) { return sameEmail(account.email, email); });
    return found == m_accounts.end() ? std::nullopt : std::optional(*found);
}

bool Accounts::isFactoryFresh() const {
    return m_accounts.size() == 1 && m_accounts.front().email == factoryEmail;
}

void Accounts::addFactoryAccount(PasswordHash password) {
    const Account account{factoryEmail, "Administrator", "admin", "Factory account", std::move(password)};
    m_store.saveAccount(account);
    m_accounts.push_back(account);
}

void Accounts::add(Account account) {
    if (!isPermission(account.permission))
        throw Refusal(Code::Malformed, "unknown permission");
    if (find(account.email))
        throw Refusal(Code::EmailTaken, "the e-mail is taken");
    const bool first = isFactoryFresh();
    if (first && account.permission != "admin")
        throw Refusal(Code::Malformed, "the first account must be an administrator");
    Transaction transaction(m_store.database());
    if (first)
        m_store.removeAccount(factoryEmail);
    m_store.saveAccount(account);
    transaction.commit();
    if (first)
        m_accounts.clear();
    m_accounts.push_back(std::move(account));
}

Account &Accounts::get(const std::string &email) {
    for (Account &account : m_accounts)
        if (sameEmail(account.email, email))
            return account;
    throw Refusal(Code::UnknownId, "no such account");
}

void Accounts::setPassword(const std::string &email, PasswordHash password) {
    Account &account = get(email);
    account.password = std::move(password);
    m_store.saveAccount(account);
}

void Accounts::setPermission(const std::string &email, const std::string &permission) {
    Account &account = get(email);
    if (!isPermission(permission))
        throw Refusal(Code::Malformed, "unknown permission");
    const bool anotherAdministrator =
        std::any_of(m_accounts.begin(), m_accounts.end(),
                    [&](const Account &other) { return &other != &account && other.permission == "admin"; });
    if (permission != "admin" && !anotherAdministrator)
        throw Refusal(Code::NotAllowed, "an administrator has to remain");
    account.permission = permission;
    m_store.saveAccount(account);
}

} // namespace emulator
