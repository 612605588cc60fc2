#include "nvldmstore.h"

#include "privatefiles.h"

#include <QDateTime>
#include <QDebug>
#include <QFile>
#include <QFileInfo>

#include <SQLiteCpp/SQLiteCpp.h>
#include <nlohmann/json.hpp>
#include <sqlite3.h>

#include <map>
#include <memory>
#include <mutex>
#include <optional>
#include <stdexcept>
#include <vector>

namespace nvldmstore {

namespace {

constexpr int busyMilliseconds = 5000;

enum class Access { Read, Write };

/// One store file of this process: its lock, and its connections once they were needed.
struct StoreFile {
    std::mutex mutex;
    std::unique_ptr<SQLite::Database> writer;
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
            throw std::runtime_error("store file cannot be created");
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

/// The damaged file keeps its contents, and what was not written back to it yet, under another name: somebody
/// may still want to rescue them.
void setAside(StoreFile &file, const std::string &path) {
    file.writer.reset();
    const QString name = QString::fromStdString(path);
    const QString aside = name + QStringLiteral(".damaged-") +
                          QDateTime::currentDateTimeUtc().toString(QStringLiteral("yyyyMMddhhmmsszzz"));
    const bool moved = QFile::rename(name, aside);
    if (moved) {
        QFile::rename(name + QStringLiteral("-wal"), aside + QStringLiteral("-wal"));
        QFile::remove(name + QStringLiteral("-shm"));
    }
    qWarning("Store file %s is damaged; %s %s", qUtf8Printable(name),
             moved ? "it was set aside as" : "it could not be renamed to", qUtf8Printable(aside));
}

/// Runs an operation under the file's lock and turns every failure into a log line and 1.
template <typename Operation>
int guarded(const char *name, const char *path, Operation operation) {
    if (!path || !*path)
        return 1;
    StoreFile &file = storeFile(path);
    const std::lock_guard lock(file.mutex);
    try {
        operation(file);
        return 0;
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

/// Table names are words of the program; quoting them keeps a mistake from becoming another statement.
std::string quoted(const char *name) {
    std::string text = "\"";
    for (; name && *name; ++name)
        text += *name == '"' ? std::string("\"\"") : std::string(1, *name);
    return text + '"';
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

} // namespace

int createDBTable(const char *file, const char *table, const char *columns) {
    return guarded("createDBTable", file, [&](StoreFile &store) {
        const std::string statement =
            "CREATE TABLE IF NOT EXISTS " + quoted(table) + " (" + (columns ? columns : "") + ")";
        try {
            writer(store, file).exec(statement);
        } catch (const SQLite::Exception &error) {
            if (!isDamage(error))
                throw;
            setAside(store, file);
            writer(store, file).exec(statement);
        }
    });
}

int queryData(const char *file, const char *table, const char *condition, std::string &result) {
    result.clear();
    return guarded("queryData", file, [&](StoreFile &store) {
        std::optional<SQLite::Database> reader;
        if (!store.writer)
            reader.emplace(file, SQLite::OPEN_READONLY, busyMilliseconds);
        result = readRows(reader ? *reader : *store.writer, table, condition)
                     .dump(-1, ' ', false, nlohmann::json::error_handler_t::replace);
    });
}

int replaceData(const char *file, const char *table, const char *values) {
    return guarded("replaceData", file, [&](StoreFile &store) {
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
    return guarded("insertListData", file, [&](StoreFile &store) {
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
    return guarded("replaceTable", file, [&](StoreFile &store) {
        SQLite::Database &database = writer(store, file);
        SQLite::Transaction transaction(database);
        database.exec("DELETE FROM " + quoted(target));
        database.exec("INSERT INTO " + quoted(target) + " SELECT * FROM " + quoted(source));
        database.exec("DROP TABLE " + quoted(source));
        transaction.commit();
    });
}

} // namespace nvldmstore
