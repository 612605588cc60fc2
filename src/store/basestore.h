#pragma once

#include <QString>

/// A key-value table of one store file.
///
/// Failures of the store library are never shown: a query then yields an empty value and a replacement false.
/// May be used from any thread.
class CBaseStore {
public:
    enum class Access {
        Own,     ///< a file of the client's: file and table are created before the first use
        ReadOnly ///< somebody else's file: never created, never changed
    };

    CBaseStore(const QString &file, const QString &table, Access access = Access::Own);

    /// The value of a key, or an empty text for a key that is missing or empty.
    QString query(const QString &key) const;

    /// Inserts or overwrites the key's row. An empty key is refused.
    bool replace(const QString &key, const QString &value);

    /// A flag as the word "YES" or "NO"; a missing key reads as "NO".
    bool queryFlag(const QString &key) const;
    bool replaceFlag(const QString &key, bool on);

private:
    bool createTable();

    QByteArray m_file;
    QByteArray m_table;
    Access m_access;
};
