#pragma once

#include "http/jsonaccess.h"
#include "tables/credentials.h"

#include <cstdint>
#include <string>

namespace emulator {

class Store;

/// Stands in for the remote-access service: the users who may sign in there, their organizations with sites,
/// and the link that this service has with it. All of it is kept in the store.
class Orb {
public:
    Orb(Store &store, std::int64_t signInMs);

    struct User {
        PasswordHash password;
        bool expired = false; ///< the password is refused although it is right
    };

    bool hasUsers() const { return !m_state.at("users").empty(); }
    void setUser(const std::string &email, const User &user);
    /// Throws Refusal(UnknownRemoteUser).
    User user(const std::string &email) const;

    /// Signs in a user whose password was looked at.
    void signIn(const std::string &email, std::int64_t nowMs);
    void forgetSignIn();

    /// The organizations of the user who is signed in. Throws Refusal(NotAccepted) when no user is signed in.
    std::string organizationsText(std::int64_t nowMs) const;
    /// As many organizations as wanted; the default three for a negative number.
    void makeOrganizations(int count);

    /// Links the service with a site. Throws Refusal for an ended sign-in and for unknown ids.
    void add(const std::string &organization, const std::string &site, std::int64_t nowMs);
    /// The rest throws Refusal(UnknownId) where there is no link.
    void disconnect();
    /// Throws Refusal(NotAllowed) for an organization that does not let support in.
    void setRemoteAccess(bool on);
    void setConnected(bool on);

    bool isAdded() const { return m_state.contains("link"); }
    std::string statusText() const;

private:
    const Json &signedIn(std::int64_t nowMs) const;
    Json &link();
    void keep();

    Store &m_store;
    std::int64_t m_signInMs;
    Json m_state;
};

} // namespace emulator
