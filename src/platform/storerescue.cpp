#include "storerescue.h"

#include <SQLiteCpp/SQLiteCpp.h>
#include <sqlite3.h>

#include <algorithm>
#include <cstdint>
#include <stdexcept>
#include <vector>

namespace StoreRescue {

namespace {

/// How many numbers of rows are tried one by one between the readable ends of a table.
constexpr std::int64_t maxProbes = 20000;

std::string quoted(const std::string &name) {
    std::string text = "\"";
    for (const char character : name)
        text += character == '"' ? std::string("\"\"") : std::string(1, character);
    return text + '"';
}

struct Table {
    std::string name;
    std::string definition;
};

std::vector<Table> readTables(SQLite::Database &source) {
    std::vector<Table> tables;
    try {
        SQLite::Statement query(source, "SELECT name, sql FROM sqlite_master WHERE type='table' AND "
                                        "sql IS NOT NULL AND name NOT LIKE 'sqlite\\_%' ESCAPE '\\'");
        while (query.executeStep())
            tables.push_back({query.getColumn(0).getString(), query.getColumn(1).getString()});
    } catch (const SQLite::Exception &) {
        // What was listed up to the damage is what there is.
    }
    return tables;
}

/// Runs a statement on the target. What the rescued file refuses is left out; only a target that cannot be
/// written is a failure, and no exception of the kind that damage throws.
template <typename Write>
bool writeTo(SQLite::Database &target, Write write) {
    try {
        write();
        return true;
    } catch (const SQLite::Exception &error) {
        const int code = error.getErrorCode();
        if (code != SQLITE_ERROR && code != SQLITE_CONSTRAINT && code != SQLITE_MISMATCH)
            throw std::runtime_error("rows cannot be written to " + target.getFilename() + ": " +
                                     error.what());
        return false;
    }
}

/// Copies one table by the numbers of its rows, so that a damaged index does not matter. Reading stops at a
/// damaged page: the table is read from both ends, and what lies between is tried row by row.
class TableCopy {
public:
    TableCopy(SQLite::Database &source, SQLite::Database &target, const std::string &table)
        : m_source(source), m_target(target), m_table(quoted(table)) {}

    int run() {
        if (walk("", 1))
            return m_copied;
        walk(" DESC", -1);
        probe();
        return m_copied;
    }

private:
    /// True when the end was reached without damage.
    bool walk(const char *order, int direction) {
        try {
            SQLite::Statement query(m_source, "SELECT rowid, * FROM " + m_table +
                                                  " NOT INDEXED ORDER BY rowid" + order);
            while (query.executeStep()) {
                const std::int64_t row = query.getColumn(0).getInt64();
                if (direction < 0 && row <= m_last)
                    return false;
                (direction > 0 ? m_last : m_first) = row;
                copy(query);
            }
            return true;
        } catch (const SQLite::Exception &) {
            return false;
        }
    }

    void probe() {
        const std::int64_t end = std::min(m_first, m_last + maxProbes);
        for (std::int64_t row = m_last + 1; row < end; ++row) {
            try {
                SQLite::Statement query(m_source,
                                        "SELECT rowid, * FROM " + m_table + " NOT INDEXED WHERE rowid=?");
                query.bind(1, row);
                if (query.executeStep())
                    copy(query);
            } catch (const SQLite::Exception &) {
                // On a damaged page; the next one may stand on another.
            }
        }
    }

    void copy(SQLite::Statement &row) {
        const int columns = row.getColumnCount() - 1;
        std::string marks;
        for (int i = 0; i < columns; ++i)
            marks += i == 0 ? "?" : ",?";
        m_copied += writeTo(m_target, [&] {
            SQLite::Statement insert(m_target,
                                     "INSERT OR REPLACE INTO " + m_table + " VALUES (" + marks + ")");
            for (int i = 1; i <= columns; ++i) {
                if (!row.getColumn(i).isNull())
                    insert.bind(i, row.getColumn(i).getString());
            }
            insert.exec();
        });
    }

    SQLite::Database &m_source;
    SQLite::Database &m_target;
    std::string m_table;
    std::int64_t m_last = 0;
    std::int64_t m_first = INT64_MAX;
    int m_copied = 0;
};

int copyTables(SQLite::Database &source, SQLite::Database &target) {
    // A file that is shorter than it says, or a table that is not understood, does not end the reading.
    source.exec("PRAGMA writable_schema=ON");
    source.exec("PRAGMA cell_size_check=ON");
    int copied = 0;
    for (const Table &table : readTables(source)) {
        if (writeTo(target, [&] { target.exec(table.definition); }))
            copied += TableCopy(source, target, table.name).run();
    }
    return copied;
}

} // namespace

int copyReadableRows(const std::string &damaged, SQLite::Database &target) {
    SQLite::Transaction transaction(target);
    int copied = 0;
    try {
        SQLite::Database source(damaged, SQLite::OPEN_READONLY);
        // The end of the last connection would write its log back, and delete it.
        sqlite3_db_config(source.getHandle(), SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, 1, nullptr);
        copied = copyTables(source, target);
    } catch (const SQLite::Exception &) {
        // No database at all.
    }
    transaction.commit();
    return copied;
}

} // namespace StoreRescue
