#include "platform/files/nvldmstore.h"

#include "platform/files/privatefiles.h"
#include "platform/files/storerescue.h"
#include "platform/files/storetrouble.h"

#include <QDateTime>
#include <QDebug>
#include <QFile>
#include <QFileInfo>
#include <QUrl>

#include <SQLiteCpp/SQLiteCpp.h>
#include <nlohmann/json.hpp>
#include <sqlite3.h>

#include <chrono>
#include <map>
#include <memory>
#include <mutex>
#include <optional>
#include <stdexcept>
#include <vector>

namespace nvldmstore {

namespace {

constexpr int busyMilliseconds = 5000;

/// After a repair that failed, the next attempt waits: it reads the whole file.
constexpr auto repairPause = std::chrono::minutes(1);

/// One store file of this process: its lock, and its connections once they were needed.
struct StoreFile {
    std::mutex mutex;
    std::unique_ptr<SQLite::Database> writer;
    bool own = false;
    std::map<std::string, std::string> tables; ///< the columns of those that were created, by name
    std::chrono::steady_clock::time_point nextRepair;
};

StoreFile &storeFile(const std::string &path) {
    static std::mutex registryMutex;
    static std::map<std::string, std::unique_ptr<StoreFile>> registry;
    const std::lock_guard lock(registryMutex);
    std::unique_ptr<StoreFile> &entry = registry[path];
    if (!entry)
        entry = std::make_unique<StoreFile>();
    return *entry;
}

/// Closing the last connection to a file deletes its log, also when the file is damaged and took nothing from
/// it.
void keepLogAtClose(SQLite::Database &database, bool keep) {
    sqlite3_db_config(database.getHandle(), SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, keep ? 1 : 0, nullptr);
}

/// A connection that writes is kept; it is opened anew when the file was removed under it.
SQLite::Database &writer(StoreFile &file, const std::string &path) {
    const QString name = QString::fromStdString(path);
    if (file.writer && !QFileInfo::exists(name))
        file.writer.reset();
    if (!file.writer) {
        if (!PrivateFiles::ensureFile(name))
            throw SQLite::Exception("store file cannot be created", SQLITE_CANTOPEN);
        auto database = std::make_unique<SQLite::Database>(path, SQLite::OPEN_READWRITE, busyMilliseconds);
        keepLogAtClose(*database, true);
        database->exec("PRAGMA journal_mode=WAL");
        database->exec("PRAGMA synchronous=FULL");
        keepLogAtClose(*database, false);
        file.writer = std::move(database);
    }
    return *file.writer;
}

bool isDamage(const SQLite::Exception &error) {
    return error.getErrorCode() == SQLITE_NOTADB || error.getErrorCode() == SQLITE_CORRUPT;
}

/// A full disk, a folder without permission: nothing that a repair could mend.
bool isRefusal(const SQLite::Exception &error) {
    const int code = error.getErrorCode();
    return code == SQLITE_FULL || code == SQLITE_IOERR || code == SQLITE_CANTOPEN ||
           code == SQLITE_READONLY || code == SQLITE_PERM || code == SQLITE_AUTH;
}

/// Table names are words of the program; quoting them keeps a mistake from becoming another statement.
std::string quoted(const std::string &name) {
    std::string text = "\"";
    for (const char character : name)
        text += character == '"' ? std::string("\"\"") : std::string(1, character);
    return text + '"';
}

std::string creation(const std::string &table, const std::string &columns) {
    return "CREATE TABLE IF NOT EXISTS " + quoted(table) + " (" + columns + ")";
}

/// Makes a new file beside the damaged one with what can be read of it.
int rescue(const StoreFile &file, const std::string &path, const std::string &fresh) {
    const QString name = QString::fromStdString(fresh);
    if (!PrivateFiles::ensureFile(name))
        throw std::runtime_error("store file cannot be created");
    SQLite::Database target(fresh, SQLite::OPEN_READWRITE, busyMilliseconds);
    const int rows = StoreRescue::copyReadableRows(path, target);
    for (const auto &[table, columns] : file.tables)
        target.exec(creation(table, columns));
    return rows;
}

/// Puts the new file in the place of the damaged one. That keeps its contents, and what was not written back
/// to it yet, under another name: somebody may still want to look at them.
bool swap(const QString &name, const QString &fresh, const QString &aside) {
    if (!QFile::rename(name, aside))
        return false;
    const QString log = name + QStringLiteral("-wal");
    if (QFileInfo(log).size() > 0)
        QFile::rename(log, aside + QStringLiteral("-wal"));
    else
        QFile::remove(log);
    QFile::remove(name + QStringLiteral("-shm"));
    if (QFile::rename(fresh, name))
        return true;
    QFile::rename(aside + QStringLiteral("-wal"), name + QStringLiteral("-wal"));
    QFile::rename(aside, name);
    return false;
}

bool repair(StoreFile &file, const std::string &path) {
    const auto now = std::chrono::steady_clock::now();
    if (now < file.nextRepair)
        return false;
    file.nextRepair = now + repairPause;
    if (file.writer)
        keepLogAtClose(*file.writer, true);
    file.writer.reset();
    const QString name = QString::fromStdString(path);
    const QString aside = name + QStringLiteral(".damaged-") +
                          QDateTime::currentDateTimeUtc().toString(QStringLiteral("yyyyMMddhhmmsszzz"));
    const QString fresh = aside + QStringLiteral(".new");
    std::string reason = "it cannot be renamed";
    try {
        const int rows = rescue(file, path, fresh.toStdString());
        if (swap(name, fresh, aside)) {
            file.nextRepair = {};
            qWarning("Store file %s is damaged; it was set aside as %s, and %d entries could be read",
                     qUtf8Printable(name), qUtf8Printable(aside), rows);
            StoreTrouble::report({StoreTrouble::Kind::Repaired, name, aside, rows});
            return true;
        }
    } catch (const std::exception &error) {
        reason = error.what();
    }
    QFile::remove(fresh);
    qWarning("Store file %s is damaged and could not be repaired: %s", qUtf8Printable(name), reason.c_str());
    StoreTrouble::report({StoreTrouble::Kind::Unrepaired, name, {}, 0});
    return false;
}

/// Runs an operation, and once more after a repair.
template <typename Operation>
void runRepairing(StoreFile &file, const std::string &path, Operation &operation) {
    try {
        operation(file);
    } catch (const SQLite::Exception &error) {
        if (!isDamage(error) || !file.own || !repair(file, path))
            throw;
        operation(file);
    }
}

enum class Access { Read, Write };

void reportRefusal(const StoreFile &file, Access access, const char *path) {
    if (!file.own || (access == Access::Read && !QFileInfo::exists(QString::fromUtf8(path))))
        return;
    const auto kind =
        access == Access::Read ? StoreTrouble::Kind::Unreadable : StoreTrouble::Kind::Unwritable;
    StoreTrouble::report({kind, QString::fromUtf8(path), {}, 0});
}

/// Runs an operation under the file's lock and turns every failure into a log line and 1.
template <typename Operation>
int guarded(const char *name, Access access, const char *path, Operation operation) {
    if (!path || !*path)
        return 1;
    StoreFile &file = storeFile(path);
    const std::lock_guard lock(file.mutex);
    file.own = file.own || access == Access::Write;
    try {
        runRepairing(file, path, operation);
        return 0;
    } catch (const SQLite::Exception &error) {
        qWarning("Store %s failed for %s: %s", name, path, error.what());
        if (isRefusal(error))
            reportRefusal(file, access, path);
    } catch (const std::exception &error) {
        qWarning("Store %s failed for %s: %s", name, path, error.what());
    } catch (...) {
        qWarning("Store %s failed for %s: Unknown exception", name, path);
    }
    return 1;
}

/// Reads "'a','it''s'" into its texts, or nothing when it is not of that form.
std::optional<std::vector<std::string>> parseValues(const std::string &text) {
    std::vector<std::string> values;
    std::size_t at = 0;
    while (true) {
        if (at >= text.size() || text[at] != '\'')
            return std::nullopt;
        std::string value;
        for (++at; at < text.size(); ++at) {
            if (text[at] != '\'')
                value += text[at];
            else if (at + 1 < text.size() && text[at + 1] == '\'')
                value += text[++at];
            else
                break;
        }
        if (at >= text.size())
            return std::nullopt;
        values.push_back(std::move(value));
        if (++at == text.size())
            return values;
        if (text[at++] != ',')
            return std::nullopt;
    }
}

std::string placeholders(std::size_t count) {
    std::string text;
    for (std::size_t i = 0; i < count; ++i)
        text += i == 0 ? "?" : ",?";
    return text;
}

std::vector<std::string> columnNames(SQLite::Database &database, const char *table) {
    std::vector<std::string> names;
    SQLite::Statement query(database, "PRAGMA table_info(" + quoted(table) + ")");
    while (query.executeStep())
        names.push_back(query.getColumn("name").getString());
    return names;
}

void bindText(SQLite::Statement &statement, int index, const nlohmann::json &value) {
    if (value.is_null())
        statement.bind(index);
    else
        statement.bind(index, value.is_string() ? value.get<std::string>() : value.dump());
}

nlohmann::json readRows(SQLite::Database &database, const char *table, const char *condition) {
    SQLite::Statement query(database, "SELECT * FROM " + quoted(table) + " " + (condition ? condition : ""));
    nlohmann::json rows = nlohmann::json::array();
    while (query.executeStep()) {
        nlohmann::json row = nlohmann::json::object();
        for (int i = 0; i < query.getColumnCount(); ++i) {
            const SQLite::Column column = query.getColumn(i);
            row[column.getName()] = column.isNull() ? nlohmann::json() : nlohmann::json(column.getString());
        }
        rows.push_back(std::move(row));
    }
    return rows;
}

/// Opens a file beside which no log can be kept, as on a full disk. A log that is there is read into memory,
/// which needs the file for this connection alone; without one the file is complete as it stands.
SQLite::Database openWithoutLog(const std::string &path) {
    const QString name = QString::fromStdString(path);
    if (QFileInfo(name + QStringLiteral("-wal")).size() == 0) {
        const QByteArray url = QUrl::fromLocalFile(name).toEncoded() + "?immutable=1";
        return {url.toStdString(), SQLite::OPEN_READONLY | SQLite::OPEN_URI, busyMilliseconds};
    }
    SQLite::Database database(path, SQLite::OPEN_READWRITE, busyMilliseconds);
    keepLogAtClose(database, true);
    database.exec("PRAGMA locking_mode=EXCLUSIVE");
    return database;
}

nlohmann::json queryRows(const StoreFile &file, const char *path, const char *table, const char *condition) {
    if (file.writer)
        return readRows(*file.writer, table, condition);
    try {
        SQLite::Database reader(path, SQLite::OPEN_READONLY, busyMilliseconds);
        return readRows(reader, table, condition);
    } catch (const SQLite::Exception &error) {
        if (!file.own || !isRefusal(error))
            throw;
    }
    SQLite::Database reader = openWithoutLog(path);
    return readRows(reader, table, condition);
}

} // namespace

int createDBTable(const char *file, const char *table, const char *columns) {
    return guarded("createDBTable", Access::Write, file, [&](StoreFile &store) {
        store.tables[table] = columns;
        writer(store, file).exec(creation(table, columns));
    });
}

int queryData(const char *file, const char *table, const char *condition, std::string &result) {
    result.clear();
    return guarded("queryData", Access::Read, file, [&](StoreFile &store) {
        result = queryRows(store, file, table, condition)
                     .dump(-1, ' ', false, nlohmann::json::error_handler_t::replace);
    });
}

int replaceData(const char *file, const char *table, const char *values) {
    return guarded("replaceData", Access::Write, file, [&](StoreFile &store) {
        const std::optional<std::vector<std::string>> texts = parseValues(values ? values : "");
        if (!texts)
            throw std::invalid_argument("values are not a list of quoted texts");
        SQLite::Statement insert(writer(store, file), "INSERT OR REPLACE INTO " + quoted(table) +
                                                          " VALUES (" + placeholders(texts->size()) + ")");
        for (std::size_t i = 0; i < texts->size(); ++i)
            insert.bind(static_cast<int>(i) + 1, (*texts)[i]);
        insert.exec();
    });
}

int insertListData(const char *file, const char *table, const char *rows) {
    return guarded("insertListData", Access::Write, file, [&](StoreFile &store) {
        const nlohmann::json list = nlohmann::json::parse(rows ? rows : "");
        if (!list.is_array())
            throw std::invalid_argument("rows are not an array");
        SQLite::Database &database = writer(store, file);
        const std::vector<std::string> columns = columnNames(database, table);
        SQLite::Transaction transaction(database);
        database.exec("DELETE FROM " + quoted(table));
        SQLite::Statement insert(database, "INSERT INTO " + quoted(table) + " VALUES (" +
                                               placeholders(columns.size()) + ")");
        for (const nlohmann::json &row : list) {
            for (std::size_t i = 0; i < columns.size(); ++i)
                bindText(insert, static_cast<int>(i) + 1, row.value(columns[i], nlohmann::json()));
            insert.exec();
            insert.reset();
        }
        transaction.commit();
    });
}

int replaceTable(const char *file, const char *source, const char *target) {
    return guarded("replaceTable", Access::Write, file, [&](StoreFile &store) {
        SQLite::Database &database = writer(store, file);
        SQLite::Transaction transaction(database);
        database.exec("DELETE FROM " + quoted(target));
        database.exec("INSERT INTO " + quoted(target) + " SELECT * FROM " + quoted(source));
        database.exec("DROP TABLE " + quoted(source));
        transaction.commit();
    });
}

} // namespace nvldmstore
