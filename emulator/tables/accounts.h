#pragma once

#include "tables/records.h"

#include <optional>
#include <string>
#include <vector>

namespace emulator {

class Store;

/// The accounts of the service. A service before its set-up holds the factory account alone.
class Accounts {
public:
    explicit Accounts(Store &store);

    /// The account of an e-mail, without regard to case.
    std::optional<Account> find(const std::string &email) const;
    const std::vector<Account> &all() const { return m_accounts; }

    bool isFactoryFresh() const;
    void addFactoryAccount(PasswordHash password);

    /// Adds an account; the first one replaces the factory account. Throws Refusal for a taken
    /// e-mail, an unknown permission and a first account that is no administrator.
    void add(Account account);
    void setPassword(const std::string &email, PasswordHash password);
    /// Throws Refusal for an unknown account or permission, and when no administrator would be left.
    void setPermission(const std::string &email, const std::string &permission);

private:
    Account &get(const std::string &email);

    Store &m_store;
    std::vector<Account> m_accounts;
};

bool sameEmail(const std::string &left, const std::string &right);

} // namespace emulator
