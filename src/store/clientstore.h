#pragma once

#include "platform/json.h"
#include "store/basestore.h"

/// An account as the login dialog offers it again. The password is kept in cipher form.
struct AccountInfo {
    QString server; ///< "IP:Port/Domain Name" text; empty for this computer
    QString email;
    QString password; ///< empty unless the user asked to be remembered
};

/// What the client remembers between runs about servers and accounts.
class CClientStore {
public:
    /// Errors of the server list.
    static constexpr unsigned serverListUnreadable = 1002;

    static CClientStore &instance();

    bool isThisComputer() const;
    bool setThisComputer(bool on);

    bool isLoginRememberMe() const;
    /// Switched off, it forgets the passwords of both accounts as well.
    bool setLoginRememberMe(bool on);

    AccountInfo thisComputerAccount() const;
    bool setThisComputerAccount(const AccountInfo &account);

    AccountInfo remoteComputerAccount() const;
    bool setRemoteComputerAccount(const AccountInfo &account);

    /// JSON text of the alarms that were read; empty where none is stored.
    QString alarmReadHistory() const;
    bool setAlarmReadHistory(const QString &json);

    /// Reads the saved servers: an array of objects with "id", "svrname", "info", "acc", "pass" (plain) and
    /// "remember"; besides "sealed", for saving it again, where the password does not decipher. Returns 0, or
    /// serverListUnreadable with an empty array.
    unsigned loadServerList(JSON &servers) const;

    /// Replaces the saved servers in one swap; the old list stays when that fails. A password is kept only
    /// where "remember" is "YES", and in cipher form; nothing is saved when one cannot be ciphered.
    bool saveServerList(const JSON &servers);

private:
    CClientStore();

    AccountInfo account(const QString &key) const;
    bool forgetPassword(const QString &key);
    bool setAccount(const QString &key, const AccountInfo &account);

    CBaseStore m_store;
    QByteArray m_serverFile;
};
