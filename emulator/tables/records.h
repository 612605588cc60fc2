#pragma once

#include "tables/credentials.h"

#include <cstdint>
#include <string>
#include <vector>

namespace emulator {

inline constexpr auto overviewId = "DO000000000000";
inline constexpr auto rootSiteId = "SR000000000000";
inline constexpr auto standby = "Standby";

struct Account {
    std::string email;
    std::string name;
    std::string permission;
    std::string description;
    PasswordHash password;
};

/// One token of a session; the newest has no end, the renewed ones live on for a moment.
struct SessionToken {
    std::string fingerprint;
    std::string session;
    std::string account;
    std::int64_t issuedAt = 0;
    std::int64_t goodUntil = 0; ///< 0 for the newest

    bool isNewest() const { return goodUntil == 0; }
};

struct Site {
    std::string id;
    std::string name;
    std::string parent;
    std::string extra; ///< a JSON object of the members that the service does not know; empty for none
};

enum class Authorization {
    Unauthorized,
    Authorized,
    AccessDenied,
    InvalidPassword,
    AccountBlocked,
    SetPassword
};

/// A device in the form in which it is kept: fifty thousand of them must stay small and be quick to list.
struct Device {
    std::string id;
    std::string macKey; ///< the MAC without separators, upper case; empty where there is none
    std::string ip;
    std::string body; ///< the record as JSON text, all but "siteid"
    std::vector<std::string> sites;
    bool sitesAsText = false; ///< "siteid" goes out as a text that holds the array
    Authorization authorization = Authorization::Unauthorized;
    bool reachable = true;
    bool held = false; ///< kept unreachable by command; life does not bring it back
    std::string action = standby;
    int refusedPasswords = 0;
    std::string secret; ///< what is kept of the account's password; empty while any long one will do
};

} // namespace emulator
