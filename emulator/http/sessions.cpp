#include "http/sessions.h"

#include "http/response.h"
#include "tables/store.h"

#include <algorithm>
#include <vector>

namespace emulator {

namespace {

constexpr std::int64_t maxUnrenewedMs = 8LL * 3600 * 1000;
constexpr std::int64_t renewAfterMs = 10LL * 60 * 1000;

} // namespace

Sessions::Sessions(Store &store, SessionLimits limits) : m_store(store), m_limits(limits) {
    for (SessionToken &token : store.tokens()) {
        const std::string key = token.fingerprint;
        m_tokens.emplace(key, std::move(token));
    }
}

std::string Sessions::open(const std::string &account, std::int64_t nowMs) {
    dropEnded(nowMs);
    if (m_limits.sessions != 0 && count() >= m_limits.sessions)
        throw Refusal(Code::NoMoreSessions, "no more sessions");
    return issue(newSessionToken(), account, nowMs);
}

std::optional<SessionToken> Sessions::find(const std::string &token, std::int64_t nowMs) {
    const auto found = m_tokens.find(fingerprint(token));
    if (found == m_tokens.end() || hasEnded(found->second, nowMs))
        return std::nullopt;
    return found->second;
}

bool Sessions::isDueForRenewal(const SessionToken &token, std::int64_t nowMs) {
    return token.isNewest() && nowMs - token.issuedAt > renewAfterMs;
}

std::optional<std::string> Sessions::renew(const std::string &session, std::int64_t nowMs) {
    Transaction transaction(m_store.database());
    std::string account;
    for (auto &[key, token] : m_tokens) {
        if (token.session == session) {
            account = token.account;
            if (token.isNewest()) {
                token.goodUntil = nowMs + m_limits.graceMs;
                m_store.saveToken(token);
            }
        }
    }
    if (account.empty())
        return std::nullopt;
    dropEnded(nowMs);
    std::string fresh = issue(session, account, nowMs);
    transaction.commit();
    return fresh;
}

void Sessions::close(const std::string &session) {
    dropWhere([&](const SessionToken &token) { return token.session == session; });
}

void Sessions::closeAll() {
    m_tokens.clear();
    m_store.removeAllTokens();
}

std::size_t Sessions::count() const {
    return static_cast<std::size_t>(std::count_if(m_tokens.begin(), m_tokens.end(),
                                                  [](const auto &entry) { return entry.second.isNewest(); }));
}

bool Sessions::hasEnded(const SessionToken &token, std::int64_t nowMs) const {
    return token.isNewest() ? nowMs - token.issuedAt > maxUnrenewedMs : nowMs >= token.goodUntil;
}

void Sessions::dropEnded(std::int64_t nowMs) {
    dropWhere([&](const SessionToken &token) { return hasEnded(token, nowMs); });
}

std::string Sessions::issue(const std::string &session, const std::string &account, std::int64_t nowMs) {
    std::string token = newSessionToken();
    const SessionToken kept{fingerprint(token), session, account, nowMs, 0};
    m_store.saveToken(kept);
    m_tokens.emplace(kept.fingerprint, kept);
    return token;
}

template <typename Condition>
void Sessions::dropWhere(Condition condition) {
    Transaction transaction(m_store.database());
    std::erase_if(m_tokens, [&](const auto &entry) {
        if (!condition(entry.second))
            return false;
        m_store.removeToken(entry.first);
        return true;
    });
    transaction.commit();
}

} // namespace emulator
