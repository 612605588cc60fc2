#pragma once

#include "api/client/apiclient.h"
#include "api/session/requestgroup.h"
#include "store/localstore.h"

#include <functional>

/// The stored session as a job uses it: every call goes out on a fresh client, carries the latest token, and
/// leaves a renewed one in the local store. Used by one thread at a time.
class ServiceSession {
public:
    explicit ServiceSession(LoginInfo login);

    /// Makes one call and returns its result; it is made again with another token of the session when the
    /// service refuses the one it carried and there is another. Nothing is sent, and ApiInvalidArgument
    /// returned, when the session was ended meanwhile.
    unsigned call(const std::function<unsigned(CApiClient &)> &endpoint);

    /// The same for a call that works with a sign-in of the service elsewhere, of which ApiCode105 may speak
    /// as well: the session is lost only when the service does not know it when asked once more.
    unsigned callWithSignIn(const std::function<unsigned(CApiClient &)> &endpoint);

    /// True when the service has told that it does not know the session any more.
    bool isLost() const { return m_lost; }

    /// True when the service may have done what the last call asked for although it failed.
    bool isUnanswered() const { return m_unanswered; }

    /// True while the stored session is still the one that this object began with.
    bool isPresent() const;

    const LoginInfo &login() const { return m_login; }

    /// The requests of this session; cut when it has ended.
    RequestGroup requests() const;

    /// Ends the stored session: its requests are cut, answers that are still on their way belong to nobody.
    static void end();

    /// Writes the log line of a session that a request is about to use.
    static void log(const LoginInfo &login);

private:
    unsigned send(const std::function<unsigned(CApiClient &)> &endpoint);

    LoginInfo m_login;
    QByteArray m_carried; ///< the token, in cipher form, of the last call
    bool m_lost = false;
    bool m_unanswered = false;
};
