#include "store/clientstore.h"

#include "platform/crypto/ciphers.h"
#include "platform/files/apppaths.h"
#include "platform/files/nvldmstore.h"

#include <QDebug>

#include <nlohmann/json.hpp>

#include <optional>

namespace {

const QString kIsThisComputer = QStringLiteral("kIsThisComputer");
const QString kIsLoginRememberMe = QStringLiteral("kIsLoginRememberMe");
const QString kThisComputerAccountInfo = QStringLiteral("kThisComputerAccountInfo");
const QString kRemoteComputerAccountInfo = QStringLiteral("kRemoteComputerAccountInfo");
const QString kAlarmReadHistory = QStringLiteral("kAlarmReadHistory");

constexpr const char *serverColumns =
    "id TEXT PRIMARY KEY, svrname TEXT, info TEXT, acc TEXT, pass TEXT, remember TEXT";
constexpr const char *serverTable = "svrsMainT";
constexpr const char *scratchTable = "tempSvrsMainT";

/// A password's cipher text that could not be opened; a row keeps it for when its key is back.
constexpr const char *sealed = "sealed";

/// The password as it is stored: as cipher text only, and only if it is wanted again. Nothing when it cannot
/// be ciphered.
std::optional<std::string> storedPassword(const JSON &server) {
    if (textMember(server, "remember") != "YES")
        return std::string();
    const std::string_view password = textMember(server, "pass");
    return password.empty() ? std::string(textMember(server, sealed)) : Ciphers::sealSecret(password);
}

std::optional<JSON> storedRow(const JSON &server) {
    JSON row;
    for (const char *name : {"id", "svrname", "info", "acc", "remember"})
        row[name] = textMember(server, name);
    const std::optional<std::string> password = storedPassword(server);
    if (!password)
        return std::nullopt;
    row["pass"] = *password;
    return row;
}

/// Turns a stored row into the server that callers know.
void openRow(JSON &server) {
    const std::string cipher(textMember(server, "pass"));
    const std::optional<std::string> password = Ciphers::openSecret(cipher);
    server["pass"] = password.value_or("");
    if (!password && !cipher.empty())
        server[sealed] = cipher;
}

} // namespace

CClientStore &CClientStore::instance() {
    static CClientStore store;
    return store;
}

CClientStore::CClientStore()
    : m_store(AppPaths::clientStoreFolder() + QStringLiteral("/nvldmgr.sdb"), QStringLiteral("appMainT")),
      m_serverFile((AppPaths::clientStoreFolder() + QStringLiteral("/ndclisvrs.sdb")).toUtf8()) {
    nvldmstore::createDBTable(m_serverFile.constData(), serverTable, serverColumns);
}

bool CClientStore::isThisComputer() const {
    return m_store.queryFlag(kIsThisComputer);
}

bool CClientStore::setThisComputer(bool on) {
    return m_store.replaceFlag(kIsThisComputer, on);
}

bool CClientStore::isLoginRememberMe() const {
    return m_store.queryFlag(kIsLoginRememberMe);
}

bool CClientStore::setLoginRememberMe(bool on) {
    const bool forgotten =
        on || (forgetPassword(kThisComputerAccountInfo) && forgetPassword(kRemoteComputerAccountInfo));
    return m_store.replaceFlag(kIsLoginRememberMe, on) && forgotten;
}

bool CClientStore::forgetPassword(const QString &key) {
    if (m_store.query(key).isEmpty())
        return true;
    AccountInfo info = account(key);
    info.password.clear();
    return setAccount(key, info);
}

AccountInfo CClientStore::thisComputerAccount() const {
    return account(kThisComputerAccountInfo);
}

bool CClientStore::setThisComputerAccount(const AccountInfo &info) {
    return setAccount(kThisComputerAccountInfo, info);
}

AccountInfo CClientStore::remoteComputerAccount() const {
    return account(kRemoteComputerAccountInfo);
}

bool CClientStore::setRemoteComputerAccount(const AccountInfo &info) {
    return setAccount(kRemoteComputerAccountInfo, info);
}

AccountInfo CClientStore::account(const QString &key) const {
    const JSON object = JSON::parse(m_store.query(key).toStdString(), nullptr, false);
    return {stringMember(object, "server"), stringMember(object, "email"),
            QString::fromStdString(Ciphers::openSecret(textMember(object, "pass")).value_or(""))};
}

bool CClientStore::setAccount(const QString &key, const AccountInfo &account) {
    const JSON object = {{"server", account.server.toStdString()},
                         {"email", account.email.toStdString()},
                         {"pass", Ciphers::sealSecret(account.password.toStdString()).value_or("")}};
    return m_store.replace(key, QString::fromStdString(dumpJson(object)));
}

QString CClientStore::alarmReadHistory() const {
    return m_store.query(kAlarmReadHistory);
}

bool CClientStore::setAlarmReadHistory(const QString &json) {
    return m_store.replace(kAlarmReadHistory, json);
}

unsigned CClientStore::loadServerList(JSON &servers) const {
    servers = JSON::array();
    std::string rows;
    if (nvldmstore::queryData(m_serverFile.constData(), serverTable, "", rows) != 0)
        return serverListUnreadable;
    servers = JSON::parse(rows, nullptr, false);
    if (!servers.is_array()) {
        servers = JSON::array();
        return serverListUnreadable;
    }
    for (JSON &server : servers)
        openRow(server);
    return 0;
}

bool CClientStore::saveServerList(const JSON &servers) {
    JSON rows = JSON::array();
    for (const JSON &server : servers) {
        std::optional<JSON> row = storedRow(server);
        if (!row)
            return false;
        rows.push_back(*std::move(row));
    }
    // The file may have been removed since the list was made.
    return nvldmstore::createDBTable(m_serverFile.constData(), serverTable, serverColumns) == 0 &&
           nvldmstore::createDBTable(m_serverFile.constData(), scratchTable, serverColumns) == 0 &&
           nvldmstore::insertListData(m_serverFile.constData(), scratchTable, dumpJson(rows).c_str()) == 0 &&
           nvldmstore::replaceTable(m_serverFile.constData(), scratchTable, serverTable) == 0;
}
