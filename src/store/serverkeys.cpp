#include "store/serverkeys.h"

#include "platform/files/apppaths.h"
#include "platform/files/nvldmstore.h"
#include "platform/json.h"
#include "store/storewriter.h"

#include <QStringList>

#include <nlohmann/json.hpp>

namespace {

constexpr const char *table = "serverKeysT";
constexpr const char *columns = "server TEXT PRIMARY KEY, fingerprint TEXT, firstseen TEXT, lastseen TEXT";
constexpr std::size_t fingerprintLength = 64;
constexpr int groupLength = 4;

QDateTime timeOf(const JSON &row, const char *name) {
    return QDateTime::fromMSecsSinceEpoch(stringMember(row, name).toLongLong());
}

std::string textOf(const QDateTime &time) {
    return std::to_string(time.toMSecsSinceEpoch());
}

QByteArray quoted(QString text) {
    return '\'' + text.replace(QLatin1Char('\''), QLatin1String("''")).toUtf8() + '\'';
}

} // namespace

const QString ServerKeys::thisComputer = QStringLiteral("local");

ServerKeys &ServerKeys::instance() {
    static ServerKeys keys(AppPaths::clientStoreFolder() + QStringLiteral("/nvldmgr.sdb"));
    return keys;
}

ServerKeys::ServerKeys(const QString &file) : m_file(file.toUtf8()) {
    load();
}

void ServerKeys::load() {
    std::string rows;
    if (nvldmstore::createDBTable(m_file.constData(), table, columns) != 0 ||
        nvldmstore::queryData(m_file.constData(), table, "", rows) != 0)
        return;
    const JSON list = JSON::parse(rows, nullptr, false);
    for (const JSON &row : list.is_array() ? list : JSON::array()) {
        const std::string fingerprint(textMember(row, "fingerprint"));
        if (fingerprint.size() == fingerprintLength)
            m_keys[stringMember(row, "server")] = {fingerprint, timeOf(row, "firstseen"),
                                                   timeOf(row, "lastseen")};
    }
}

std::optional<ServerKey> ServerKeys::find(const QString &server) const {
    const std::lock_guard lock(m_mutex);
    const auto found = m_keys.find(server);
    return found == m_keys.end() ? std::nullopt : std::optional(found->second);
}

std::string ServerKeys::fingerprint(const QString &server) const {
    const std::optional<ServerKey> key = find(server);
    return key ? key->fingerprint : std::string();
}

bool ServerKeys::keep(const QString &server, const std::string &fingerprint) {
    const std::lock_guard lock(m_mutex);
    const QDateTime now = QDateTime::currentDateTime();
    const auto [place, isNew] = m_keys.try_emplace(server, ServerKey{fingerprint, now, now});
    if (place->second.fingerprint != fingerprint)
        return false;
    place->second.lastSeen = now;
    write(server, place->second);
    return isNew;
}

void ServerKeys::trust(const QString &server, const std::string &fingerprint) {
    const std::lock_guard lock(m_mutex);
    const QDateTime now = QDateTime::currentDateTime();
    m_keys[server] = {fingerprint, now, now};
    write(server, m_keys[server]);
}

void ServerKeys::write(const QString &server, const ServerKey &key) const {
    const QByteArray values = quoted(server) + ",'" +
                              QByteArray::fromStdString(key.fingerprint + "','" + textOf(key.firstSeen) +
                                                        "','" + textOf(key.lastSeen)) +
                              '\'';
    StoreWriter::post([file = m_file, values] {
        // The file may have been removed since it was read.
        nvldmstore::createDBTable(file.constData(), table, columns);
        nvldmstore::replaceData(file.constData(), table, values.constData());
    });
}

void ServerKeys::forget(const QString &server) {
    const std::lock_guard lock(m_mutex);
    if (m_keys.erase(server) == 0)
        return;
    JSON rows = JSON::array();
    for (const auto &[name, key] : m_keys)
        rows.push_back({{"server", name.toStdString()},
                        {"fingerprint", key.fingerprint},
                        {"firstseen", textOf(key.firstSeen)},
                        {"lastseen", textOf(key.lastSeen)}});
    StoreWriter::post([file = m_file, text = dumpJson(rows)] {
        nvldmstore::insertListData(file.constData(), table, text.c_str());
    });
}

QString ServerKeys::readable(const std::string &fingerprint) {
    QStringList groups;
    const QString digits = QString::fromStdString(fingerprint).toUpper();
    for (int at = 0; at < digits.size(); at += groupLength)
        groups.append(digits.mid(at, groupLength));
    return groups.join(QLatin1Char(' '));
}
