#pragma once

#include <QDateTime>
#include <QString>

#include <map>
#include <mutex>
#include <optional>
#include <string>

/// The public key with which a server was met before.
struct ServerKey {
    std::string fingerprint; ///< SHA-256 of the SubjectPublicKeyInfo (DER) in lower case hex
    QDateTime firstSeen;
    QDateTime lastSeen;
};

/// The keys of the servers that somebody has logged in to, in a table of the client store. Read once, when
/// the first one asks; changes are written by StoreWriter. Any thread.
class ServerKeys {
public:
    /// The name of the service on this computer. Any other server is "host:port" as the user names it, in
    /// lower case.
    static const QString thisComputer;

    /// Of the client store.
    static ServerKeys &instance();
    explicit ServerKeys(const QString &file);

    std::optional<ServerKey> find(const QString &server) const;
    /// Empty for a server without a key.
    std::string fingerprint(const QString &server) const;

    /// After a successful log-in: keeps the key of a server that has none, and renews the time of one that
    /// has. True when it was kept for the first time.
    bool keep(const QString &server, const std::string &fingerprint);
    /// Puts a key in the place of the one that is remembered.
    void trust(const QString &server, const std::string &fingerprint);
    void forget(const QString &server);

    /// A fingerprint as people read it: upper case, in groups of four digits.
    static QString readable(const std::string &fingerprint);

private:
    void load();
    void write(const QString &server, const ServerKey &key) const;

    QByteArray m_file;
    mutable std::mutex m_mutex;
    std::map<QString, ServerKey> m_keys;
};
