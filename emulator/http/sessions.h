#pragma once

#include "tables/records.h"

#include <optional>
#include <string>
#include <unordered_map>

namespace emulator {

class Store;

struct SessionLimits {
    std::size_t sessions = 0; ///< 0 for no limit
    std::int64_t graceMs = 60000;
};

/// The sessions and their tokens, of which only fingerprints are kept.
class Sessions {
public:
    Sessions(Store &store, SessionLimits limits);

    /// A new session's token. Throws Refusal when there are as many sessions as there may be.
    std::string open(const std::string &account, std::int64_t nowMs);

    /// What is known of a token that is good now.
    std::optional<SessionToken> find(const std::string &token, std::int64_t nowMs);

    /// True when the token is the newest of its session and has been in use for long.
    static bool isDueForRenewal(const SessionToken &token, std::int64_t nowMs);

    /// A fresh token for the session; those before it stay good for a moment. Nothing for a session that has
    /// ended meanwhile.
    std::optional<std::string> renew(const std::string &session, std::int64_t nowMs);

    void close(const std::string &session);
    void closeAll();
    std::size_t count() const;

private:
    bool hasEnded(const SessionToken &token, std::int64_t nowMs) const;
    void dropEnded(std::int64_t nowMs);
    std::string issue(const std::string &session, const std::string &account, std::int64_t nowMs);
    template <typename Condition>
    void dropWhere(Condition condition);

    Store &m_store;
    SessionLimits m_limits;
    std::unordered_map<std::string, SessionToken> m_tokens;
};

} // namespace emulator
