#include "tables/store.h"

#include "http/jsonaccess.h"

#include <utility>

namespace emulator {

namespace {

// The order of accounts, sites and devices is that of their rows; an upsert keeps the row.
constexpr auto schema = R"(
CREATE TABLE IF NOT EXISTS value(key TEXT PRIMARY KEY, value TEXT NOT NULL);
CREATE TABLE IF NOT EXISTS account(row INTEGER PRIMARY KEY, email TEXT UNIQUE NOT NULL, name TEXT NOT NULL,
    permission TEXT NOT NULL, description TEXT NOT NULL, salt TEXT NOT NULL, hash TEXT NOT NULL,
    rounds INTEGER NOT NULL);
CREATE TABLE IF NOT EXISTS token(fingerprint TEXT PRIMARY KEY, session TEXT NOT NULL, account TEXT NOT NULL,
    issued_at INTEGER NOT NULL, good_until INTEGER NOT NULL);
CREATE TABLE IF NOT EXISTS site(row INTEGER PRIMARY KEY, id TEXT UNIQUE NOT NULL, name TEXT NOT NULL,
    parent TEXT NOT NULL, extra TEXT NOT NULL);
CREATE TABLE IF NOT EXISTS device(row INTEGER PRIMARY KEY, id TEXT UNIQUE NOT NULL, body TEXT NOT NULL,
    sites TEXT NOT NULL, sites_as_text INTEGER NOT NULL, mac_key TEXT NOT NULL, ip TEXT NOT NULL,
    authorized INTEGER NOT NULL, reachable INTEGER NOT NULL, held INTEGER NOT NULL, refused INTEGER NOT NULL);
CREATE TABLE IF NOT EXISTS device_secret(device TEXT PRIMARY KEY, secret TEXT NOT NULL);
CREATE TABLE IF NOT EXISTS task(row INTEGER PRIMARY KEY AUTOINCREMENT, head TEXT NOT NULL,
    devices TEXT NOT NULL, work TEXT NOT NULL);
CREATE TABLE IF NOT EXISTS alarm(row INTEGER PRIMARY KEY AUTOINCREMENT, at INTEGER NOT NULL, body TEXT NOT NULL);
CREATE TABLE IF NOT EXISTS log(row INTEGER PRIMARY KEY AUTOINCREMENT, at INTEGER NOT NULL, body TEXT NOT NULL);
)";

std::vector<std::string> listOf(const std::string &json) {
    return Json::parse(json).get<std::vector<std::string>>();
}

} // namespace

Store::Schema::Schema(Database &database) {
    // A crash of the program loses nothing this way; only a crash of the machine may lose the last moments.
    database.run("PRAGMA journal_mode=WAL");
    database.run("PRAGMA synchronous=NORMAL");
    database.run(schema);
}

Store::Store(const std::filesystem::path &path)
    : m_database(path),
      m_schema(m_database),
      m_value(m_database, "SELECT value FROM value WHERE key=?"),
      m_setValue(m_database,
                 "INSERT INTO value VALUES(?,?) ON CONFLICT(key) DO UPDATE SET value=excluded.value"),
      m_saveAccount(m_database,
                    "INSERT INTO account(email,name,permission,description,salt,hash,rounds) "
                    "VALUES(?,?,?,?,?,?,?) ON CONFLICT(email) DO UPDATE SET name=excluded.name,"
                    "permission=excluded.permission,description=excluded.description,salt=excluded.salt,"
                    "hash=excluded.hash,rounds=excluded.rounds"),
      m_removeAccount(m_database, "DELETE FROM account WHERE email=?"),
      m_saveToken(m_database, "INSERT OR REPLACE INTO token VALUES(?,?,?,?,?)"),
      m_removeToken(m_database, "DELETE FROM token WHERE fingerprint=?"),
      m_saveSite(m_database, "INSERT INTO site(id,name,parent,extra) VALUES(?,?,?,?)"),
      m_saveDevice(
          m_database,
          "INSERT INTO device(id,body,sites,sites_as_text,mac_key,ip,authorized,reachable,held,refused) "
          "VALUES(?,?,?,?,?,?,?,?,?,?) ON CONFLICT(id) DO UPDATE SET body=excluded.body,"
          "sites=excluded.sites,sites_as_text=excluded.sites_as_text,mac_key=excluded.mac_key,"
          "ip=excluded.ip,authorized=excluded.authorized,reachable=excluded.reachable,"
          "held=excluded.held,refused=excluded.refused"),
      m_saveDeviceSites(m_database, "UPDATE device SET sites=?,sites_as_text=? WHERE id=?"),
      m_saveDeviceState(m_database, "UPDATE device SET authorized=?,reachable=?,held=?,refused=? WHERE id=?"),
      m_saveDeviceSecret(m_database, "INSERT OR REPLACE INTO device_secret VALUES(?,?)"),
      m_removeDeviceSecret(m_database, "DELETE FROM device_secret WHERE device=?"),
      m_removeDevice(m_database, "DELETE FROM device WHERE id=?") {}

std::string Store::value(const std::string &key) {
    m_value.bind(key);
    std::string text = m_value.step() ? m_value.text(0) : std::string();
    m_value.reset();
    return text;
}

void Store::setValue(const std::string &key, const std::string &value) {
    m_setValue.bind(key).bind(value).run();
}

std::int64_t Store::lastRow(const std::string &table) {
    Statement sequence(m_database, "SELECT seq FROM sqlite_sequence WHERE name=?");
    sequence.bind(table);
    return sequence.step() ? sequence.integer(0) : 0;
}

std::vector<Account> Store::accounts() {
    std::vector<Account> all;
    Statement rows(m_database,
                   "SELECT email,name,permission,description,salt,hash,rounds FROM account ORDER BY row");
    while (rows.step()) {
        all.push_back({rows.text(0),
                       rows.text(1),
                       rows.text(2),
                       rows.text(3),
                       {rows.text(4), rows.text(5), static_cast<int>(rows.integer(6))}});
    }
    return all;
}

void Store::saveAccount(const Account &account) {
    m_saveAccount.bind(account.email)
        .bind(account.name)
        .bind(account.permission)
        .bind(account.description)
        .bind(account.password.salt)
        .bind(account.password.hash)
        .bind(account.password.rounds)
        .run();
}

void Store::removeAccount(const std::string &email) {
    m_removeAccount.bind(email).run();
}

std::vector<SessionToken> Store::tokens() {
    std::vector<SessionToken> all;
    Statement rows(m_database, "SELECT fingerprint,session,account,issued_at,good_until FROM token");
    while (rows.step())
        all.push_back({rows.text(0), rows.text(1), rows.text(2), rows.integer(3), rows.integer(4)});
    return all;
}

void Store::saveToken(const SessionToken &token) {
    m_saveToken.bind(token.fingerprint)
        .bind(token.session)
        .bind(token.account)
        .bind(token.issuedAt)
        .bind(token.goodUntil)
        .run();
}

void Store::removeToken(const std::string &fingerprint) {
    m_removeToken.bind(fingerprint).run();
}

void Store::removeAllTokens() {
    m_database.run("DELETE FROM token");
}

std::vector<Site> Store::sites() {
    std::vector<Site> all;
    Statement rows(m_database, "SELECT id,name,parent,extra FROM site ORDER BY row");
    while (rows.step())
        all.push_back({rows.text(0), rows.text(1), rows.text(2), rows.text(3)});
    return all;
}

void Store::replaceSites(const std::vector<Site> &sites) {
    Transaction transaction(m_database);
    m_database.run("DELETE FROM site");
    for (const Site &site : sites)
        m_saveSite.bind(site.id).bind(site.name).bind(site.parent).bind(site.extra).run();
    transaction.commit();
}

void Store::loadDevices(const std::function<void(Device)> &take) {
    Statement rows(m_database,
                   "SELECT id,mac_key,ip,body,sites,sites_as_text,authorized,reachable,held,refused,"
                   "coalesce(secret,'') FROM device LEFT JOIN device_secret ON device=id ORDER BY row");
    while (rows.step()) {
        Device device;
        device.id = rows.text(0);
        device.macKey = rows.text(1);
        device.ip = rows.text(2);
        device.body = rows.text(3);
        device.sites = listOf(rows.text(4));
        device.sitesAsText = rows.integer(5) != 0;
        device.authorization = static_cast<Authorization>(rows.integer(6));
        device.reachable = rows.integer(7) != 0;
        device.held = rows.integer(8) != 0;
        device.refusedPasswords = static_cast<int>(rows.integer(9));
        device.secret = rows.text(10);
        take(std::move(device));
    }
}

void Store::saveDevice(const Device &device) {
    const std::string sites = jsonText(device.sites);
    m_saveDevice.bind(device.id)
        .bind(device.body)
        .bind(sites)
        .bind(device.sitesAsText)
        .bind(device.macKey)
        .bind(device.ip)
        .bind(static_cast<int>(device.authorization))
        .bind(device.reachable)
        .bind(device.held)
        .bind(device.refusedPasswords)
        .run();
}

void Store::saveDeviceSites(const Device &device) {
    const std::string sites = jsonText(device.sites);
    m_saveDeviceSites.bind(sites).bind(device.sitesAsText).bind(device.id).run();
}

void Store::saveDeviceState(const Device &device) {
    m_saveDeviceState.bind(static_cast<int>(device.authorization))
        .bind(device.reachable)
        .bind(device.held)
        .bind(device.refusedPasswords)
        .bind(device.id)
        .run();
}

void Store::saveDeviceSecret(const Device &device) {
    m_removeDeviceSecret.bind(device.id).run();
    if (!device.secret.empty())
        m_saveDeviceSecret.bind(device.id).bind(device.secret).run();
}

void Store::removeDevice(const std::string &id) {
    m_removeDeviceSecret.bind(id).run();
    m_removeDevice.bind(id).run();
}

} // namespace emulator
