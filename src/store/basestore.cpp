#include "store/basestore.h"

#include "platform/files/nvldmstore.h"
#include "platform/json.h"

#include <nlohmann/json.hpp>

CBaseStore::CBaseStore(const QString &file, const QString &table, Access access)
    : m_file(file.toUtf8()), m_table(table.toUtf8()), m_access(access) {
    if (m_access == Access::Own)
        createTable();
}

bool CBaseStore::createTable() {
    return nvldmstore::createDBTable(m_file.constData(), m_table.constData(),
                                     "key TEXT PRIMARY KEY, value TEXT") == 0;
}

QString CBaseStore::query(const QString &key) const {
    if (key.isEmpty())
        return {};
    const QByteArray condition = "WHERE key=\"" + key.toUtf8() + '"';
    std::string rows;
    if (nvldmstore::queryData(m_file.constData(), m_table.constData(), condition.constData(), rows) != 0)
        return {};
    const JSON list = JSON::parse(rows, nullptr, false);
    return list.is_array() && !list.empty() ? stringMember(list[0], "value") : QString();
}

bool CBaseStore::replace(const QString &key, const QString &value) {
    if (key.isEmpty() || m_access == Access::ReadOnly)
        return false;
    const auto doubled = [](QString text) {
        return text.replace(QLatin1Char('\''), QLatin1String("''")).toUtf8();
    };
    const QByteArray values = '\'' + doubled(key) + "','" + doubled(value) + '\'';
    const auto write = [&] {
        return nvldmstore::replaceData(m_file.constData(), m_table.constData(), values.constData()) == 0;
    };
    // A file that was removed under the program is there anew, without its table.
    return write() || (createTable() && write());
}

bool CBaseStore::queryFlag(const QString &key) const {
    return query(key) == QLatin1String("YES");
}

bool CBaseStore::replaceFlag(const QString &key, bool on) {
    return replace(key, on ? QStringLiteral("YES") : QStringLiteral("NO"));
}
