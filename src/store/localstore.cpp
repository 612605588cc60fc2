#include "store/localstore.h"

#include "platform/crypto/ciphers.h"
#include "platform/files/apppaths.h"
#include "platform/log/messagelog.h"
#include "store/serverkeys.h"

#include <QDebug>

namespace {
const QString kLayoutPrefix = QStringLiteral("kLayout_");
const QString kDefaultFilePath = QStringLiteral("kDefaultFilePath");
const QString kMissingKeyTold = QStringLiteral("kMissingKeyTold");
const QString kUiLanguage = QStringLiteral("kUiLanguage");
const QString kPendingExports = QStringLiteral("kPendingExports");
const QString kFwUploadOnlyApplyFail = QStringLiteral("kFwUploadOnlyApplyFail");
const QString kFWUploadScheduleOnOff = QStringLiteral("kFWUploadScheduleOnOff");
const QString kFwRolloutsPrefix = QStringLiteral("kFwRollouts_");

constexpr qsizetype maxSpares = 8;

QByteArray cipherOf(const QByteArray &rawToken) {
    qDebug("CLocalStore::setAccess > strRawToken: %s", MessageLog::secret(rawToken).constData());
    const auto cipher =
        Ciphers::sealSecret({rawToken.constData(), static_cast<std::size_t>(rawToken.size())});
    const QByteArray token = QByteArray::fromStdString(cipher.value_or(""));
    qDebug("CLocalStore::setAccess > szCipherToken: %s", MessageLog::secret(token).constData());
    return token;
}
} // namespace

CLocalStore &CLocalStore::instance() {
    static CLocalStore store;
    return store;
}

CLocalStore::CLocalStore()
    : m_store(AppPaths::clientStoreFolder() + QStringLiteral("/nvldmuio.sdb"), QStringLiteral("appMainT")) {}

bool CLocalStore::isLocalServiceInstalled() const {
    const std::lock_guard lock(m_mutex);
    return m_localServiceInstalled;
}

void CLocalStore::setLocalServiceInstalled(bool installed) {
    const std::lock_guard lock(m_mutex);
    m_localServiceInstalled = installed;
}

void CLocalStore::setLoginInfo(const QString &address, quint32 port, const QString &account,
                               const QByteArray &token, bool thisComputer) {
    qDebug("CLocalStore::setLoginInfo > strToken: %s", MessageLog::secret(token).constData());
    const std::lock_guard lock(m_mutex);
    m_login = {address, port, account, token, thisComputer, m_login.generation + 1, {}, {}};
    m_access = token;
    m_spares.clear();
}

void CLocalStore::setServerKey(const QString &server, const std::string &fingerprint) {
    const std::lock_guard lock(m_mutex);
    m_login.server = server;
    m_login.serverKey = fingerprint;
}

void CLocalStore::trustServerKey(const std::string &fingerprint, quint64 generation) {
    const std::lock_guard lock(m_mutex);
    if (m_login.generation != generation)
        return;
    m_login.serverKey = fingerprint;
    if (!m_login.server.isEmpty())
        ServerKeys::instance().trust(m_login.server, fingerprint);
}

LoginInfo CLocalStore::loginInfo() const {
    const std::lock_guard lock(m_mutex);
    return m_login;
}

void CLocalStore::clearLoginInfo() {
    const std::lock_guard lock(m_mutex);
    m_login = {{}, 0, {}, {}, false, m_login.generation + 1, {}, {}};
    m_access.clear();
    m_spares.clear();
}

void CLocalStore::setAccess(const QByteArray &rawToken) {
    const QByteArray token = cipherOf(rawToken);
    const std::lock_guard lock(m_mutex);
    m_access = token;
}

void CLocalStore::renewAccess(const QByteArray &rawToken, const QByteArray &carried, quint64 generation) {
    const QByteArray token = cipherOf(rawToken);
    const std::lock_guard lock(m_mutex);
    if (m_login.generation != generation || token.isEmpty())
        return;
    if (m_login.token == carried)
        m_spares.clear();
    else if (m_spares.size() < maxSpares)
        m_spares.append(m_login.token);
    m_access = token;
    m_login.token = token;
}

bool CLocalStore::replaceRefused(const QByteArray &carried, quint64 generation) {
    const std::lock_guard lock(m_mutex);
    if (m_login.generation != generation)
        return false;
    if (m_login.token != carried)
        return true;
    if (m_spares.isEmpty())
        return false;
    m_login.token = m_access = m_spares.takeLast();
    return true;
}

QByteArray CLocalStore::access() const {
    const std::lock_guard lock(m_mutex);
    return m_access;
}

QString CLocalStore::layout(const QString &name) const {
    return m_store.query(kLayoutPrefix + name);
}

bool CLocalStore::setLayout(const QString &name, const QString &layout) {
    return m_store.replace(kLayoutPrefix + name, layout);
}

QString CLocalStore::defaultFilePath() const {
    return m_store.query(kDefaultFilePath);
}

bool CLocalStore::setDefaultFilePath(const QString &folder) {
    return m_store.replace(kDefaultFilePath, folder);
}

bool CLocalStore::isMissingKeyTold() const {
    return m_store.queryFlag(kMissingKeyTold);
}

bool CLocalStore::setMissingKeyTold(bool told) {
    return m_store.replaceFlag(kMissingKeyTold, told);
}

QString CLocalStore::uiLanguage() const {
    return m_store.query(kUiLanguage);
}

bool CLocalStore::setUiLanguage(const QString &language) {
    return m_store.replace(kUiLanguage, language);
}

QString CLocalStore::pendingExports() const {
    return m_store.query(kPendingExports);
}

bool CLocalStore::setPendingExports(const QString &json) {
    return m_store.replace(kPendingExports, json);
}

bool CLocalStore::isFwUploadOnlyApplyFail() const {
    return m_store.queryFlag(kFwUploadOnlyApplyFail);
}

bool CLocalStore::setFwUploadOnlyApplyFail(bool on) {
    return m_store.replaceFlag(kFwUploadOnlyApplyFail, on);
}

bool CLocalStore::isFWUploadScheduleOn() const {
    return m_store.queryFlag(kFWUploadScheduleOnOff);
}

bool CLocalStore::setFWUploadScheduleOn(bool on) {
    return m_store.replaceFlag(kFWUploadScheduleOnOff, on);
}

QString CLocalStore::fwRollouts(const QString &session) const {
    return m_store.query(kFwRolloutsPrefix + session);
}

bool CLocalStore::setFwRollouts(const QString &session, const QString &json) {
    return m_store.replace(kFwRolloutsPrefix + session, json);
}
