#pragma once

#include "store/basestore.h"

#include <QByteArray>
#include <QByteArrayList>

#include <mutex>
#include <string>

/// A session with a service as every request needs it.
struct LoginInfo {
    QString address;
    quint32 port = 0;
    QString account;
    QByteArray token;          ///< the access token in cipher form
    bool thisComputer = false; ///< the service runs on this computer and reads its files
    quint64 generation = 0; ///< raised by every log-in and log-off; tells an old session from the present one
    QString server;         ///< under which ServerKeys remembers the server
    std::string serverKey;  ///< fingerprint of the only key that the session's requests go to; empty for any

    /// True when there is all that a request needs.
    bool isComplete() const { return !address.isEmpty() && !account.isEmpty() && !token.isEmpty(); }
};

/// The client's user-interface options, and the present session (in memory only). Any thread.
class CLocalStore {
public:
    static CLocalStore &instance();

    bool isLocalServiceInstalled() const;
    void setLocalServiceInstalled(bool installed);

    /// Begins a session; the token is in cipher form, as access() gives it.
    void setLoginInfo(const QString &address, quint32 port, const QString &account, const QByteArray &token,
                      bool thisComputer = false);
    /// Names the server of the session and the key that it has shown at the log-in.
    void setServerKey(const QString &server, const std::string &fingerprint);
    /// Lets the session go on with another key, in the client store too, unless it was ended meanwhile.
    void trustServerKey(const std::string &fingerprint, quint64 generation);
    LoginInfo loginInfo() const;
    /// Ends the session; answers that are still on their way belong to nobody from now on.
    void clearLoginInfo();

    /// Ciphers a raw token and keeps it as the present one.
    void setAccess(const QByteArray &rawToken);
    /// The same for a token that the service renewed, unless its session was ended meanwhile. carried: the
    /// token, in cipher form, of the request that brought it. Where that is not the present one, requests
    /// were under way together and their answers came in any order: the present token may be the newer one,
    /// and is kept as a spare.
    void renewAccess(const QByteArray &rawToken, const QByteArray &carried, quint64 generation);
    /// The service does not accept the token that a request carried. True when there is another to try, which
    /// is the present one then.
    bool replaceRefused(const QByteArray &carried, quint64 generation);
    QByteArray access() const;

    /// How the user has arranged a part of a window, under a name of the part's own; empty where nothing is
    /// kept.
    QString layout(const QString &name) const;
    bool setLayout(const QString &name, const QString &layout);

    QString defaultFilePath() const;
    bool setDefaultFilePath(const QString &folder);

    /// Whether the user was told that there is no key file.
    bool isMissingKeyTold() const;
    bool setMissingKeyTold(bool told);
    /// Code of the language that the windows are to speak; empty for that of the system.
    QString uiLanguage() const;
    bool setUiLanguage(const QString &language);
    /// JSON text of the exports that were asked for and not collected; empty where none is stored.
    QString pendingExports() const;
    bool setPendingExports(const QString &json);
    /// Whether firmware goes to those devices alone whose last upload failed.
    bool isFwUploadOnlyApplyFail() const;
    bool setFwUploadOnlyApplyFail(bool on);
    /// Whether firmware goes out at a time, and not at once.
    bool isFWUploadScheduleOn() const;
    bool setFWUploadScheduleOn(bool on);

    /// JSON text of the rollouts that a session has begun; empty where none is stored. session: a word for
    /// server and account.
    QString fwRollouts(const QString &session) const;
    bool setFwRollouts(const QString &session, const QString &json);

private:
    CLocalStore();

    CBaseStore m_store;
    mutable std::mutex m_mutex;
    bool m_localServiceInstalled = false;
    LoginInfo m_login;
    QByteArray m_access;
    QByteArrayList m_spares; ///< tokens of the session in cipher form, the latest at the end
};
