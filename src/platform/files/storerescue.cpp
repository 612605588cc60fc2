#include "platform/files/storerescue.h"

#include "platform/files/privatefiles.h"

#include <QFile>

#include <SQLiteCpp/SQLiteCpp.h>
#include <sqlite3.h>

#include <algorithm>
#include <cstdint>
#include <fstream>
#include <iterator>
#include <map>
#include <optional>
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
    std::size_t rootPage;
};

std::vector<Table> readTables(SQLite::Database &source) {
    std::vector<Table> tables;
    try {
        SQLite::Statement query(source,
                                "SELECT name, sql, rootpage FROM sqlite_master WHERE type='table' AND "
                                "sql IS NOT NULL AND name NOT LIKE 'sqlite\\_%' ESCAPE '\\'");
        while (query.executeStep())
            tables.push_back({query.getColumn(0).getString(), query.getColumn(1).getString(),
                              static_cast<std::size_t>(query.getColumn(2).getInt64())});
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

/// Rows by their numbers, which grow with every write: of two with the same key the later one is right.
using Row = std::vector<std::optional<std::string>>;
using Rows = std::map<std::int64_t, Row>;

void take(SQLite::Statement &query, Rows &rows) {
    Row row;
    for (int i = 1; i < query.getColumnCount(); ++i) {
        const SQLite::Column column = query.getColumn(i);
        row.push_back(column.isNull() ? std::nullopt : std::optional(column.getString()));
    }
    rows.emplace(query.getColumn(0).getInt64(), std::move(row));
}

/// Opens a damaged file so that one that is shorter than it says, or a table that is not understood, does not
/// end the reading, and so that its log stays as it is.
SQLite::Database openDamaged(const std::string &path) {
    SQLite::Database database(path, SQLite::OPEN_READONLY);
    sqlite3_db_config(database.getHandle(), SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, 1, nullptr);
    database.exec("PRAGMA writable_schema=ON");
    database.exec("PRAGMA cell_size_check=ON");
    return database;
}

/// Reads one table by the numbers of its rows, so that a damaged index does not matter. Reading stops at a
/// damaged page: the table is read from both ends, and what lies between is tried row by row.
class TableReader {
public:
    TableReader(SQLite::Database &source, const std::string &table)
        : m_source(source), m_table(quoted(table)) {}

    /// True when there was no damage.
    bool run(Rows &rows) {
        if (walk("", rows))
            return true;
        const std::int64_t last = rows.empty() ? 0 : rows.rbegin()->first;
        walk(" DESC", rows);
        const auto next = rows.upper_bound(last);
        probe(last + 1, next == rows.end() ? INT64_MAX : next->first, rows);
        return false;
    }

    /// True when the end was reached, or a row that is known.
    bool walk(const char *order, Rows &rows) {
        try {
            SQLite::Statement query(m_source, "SELECT rowid, * FROM " + m_table +
                                                  " NOT INDEXED ORDER BY rowid" + order);
            while (query.executeStep() && rows.count(query.getColumn(0).getInt64()) == 0)
                take(query, rows);
            return true;
        } catch (const SQLite::Exception &) {
            return false;
        }
    }

private:
    void probe(std::int64_t begin, std::int64_t end, Rows &rows) {
        for (std::int64_t row = begin; row < std::min(end, begin + maxProbes); ++row) {
            try {
                SQLite::Statement query(m_source,
                                        "SELECT rowid, * FROM " + m_table + " NOT INDEXED WHERE rowid=?");
                query.bind(1, row);
                if (query.executeStep())
                    take(query, rows);
            } catch (const SQLite::Exception &) {
                // On a damaged page; the next one may stand on another.
            }
        }
    }

    SQLite::Database &m_source;
    std::string m_table;
};

int writeRows(SQLite::Database &target, const std::string &table, const Rows &rows) {
    int written = 0;
    for (const auto &[number, row] : rows) {
        std::string marks;
        for (std::size_t i = 0; i < row.size(); ++i)
            marks += i == 0 ? "?" : ",?";
        written += writeTo(target, [&target, &table, &row = row, &marks] {
            SQLite::Statement insert(target,
                                     "INSERT OR REPLACE INTO " + quoted(table) + " VALUES (" + marks + ")");
            for (std::size_t i = 0; i < row.size(); ++i) {
                if (row[i])
                    insert.bind(static_cast<int>(i) + 1, *row[i]);
            }
            insert.exec();
        });
    }
    return written;
}

/// Finds the rows of tables whose upper pages are damaged, which nothing leads to any more: each page of rows
/// is put where the table begins, in a copy of the file, and read there.
class PageScan {
public:
    explicit PageScan(const std::string &damaged) : m_copy(damaged + ".scan") {
        std::ifstream file(damaged, std::ios::binary);
        m_bytes.assign(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
        if (m_bytes.size() < headSize || m_bytes.size() > maxScanBytes)
            return;
        m_pageSize = byteAt(16) == 0 && byteAt(17) == 1 ? 65536 : byteAt(16) * 256 + byteAt(17);
        // The copy has no log beside it.
        m_bytes[18] = m_bytes[19] = 1;
        if (m_pageSize >= 512 && PrivateFiles::ensureFile(QString::fromStdString(m_copy)))
            std::ofstream(m_copy, std::ios::binary) << m_bytes;
    }
    ~PageScan() { QFile::remove(QString::fromStdString(m_copy)); }
    PageScan(const PageScan &) = delete;
    PageScan &operator=(const PageScan &) = delete;

    void read(const Table &table, std::size_t columns, Rows &rows) const {
        const std::size_t pages = m_pageSize < 512 ? 0 : m_bytes.size() / m_pageSize;
        if (table.rootPage < 2 || table.rootPage > pages)
            return;
        for (std::size_t page = 1; page < pages; ++page) {
            if (columnsOn(page * m_pageSize) == columns)
                readPage(page, table, rows);
        }
    }

private:
    static constexpr std::size_t headSize = 100;
    static constexpr std::size_t maxScanBytes = std::size_t{16} << 20;

    std::size_t byteAt(std::size_t at) const {
        return at < m_bytes.size() ? static_cast<unsigned char>(m_bytes[at]) : 0;
    }

    std::size_t numberAt(std::size_t &at) const {
        std::size_t number = 0;
        for (int i = 0; i < 9; ++i) {
            const std::size_t byte = byteAt(at++);
            number = number << 7 | (byte & 0x7f);
            if (byte < 0x80)
                break;
        }
        return number;
    }

    /// How many columns the first row of the page has; 0 for a page of something else.
    std::size_t columnsOn(std::size_t page) const {
        constexpr std::size_t rowPage = 13;
        if (byteAt(page) != rowPage || byteAt(page + 3) + byteAt(page + 4) == 0)
            return 0;
        std::size_t at = page + byteAt(page + 8) * 256 + byteAt(page + 9);
        numberAt(at); // bytes of the row
        numberAt(at); // its number
        const std::size_t begin = at;
        const std::size_t end = begin + std::min(numberAt(at), m_pageSize);
        std::size_t columns = 0;
        for (; at < end; ++columns)
            numberAt(at);
        return columns;
    }

    void readPage(std::size_t page, const Table &table, Rows &rows) const {
        {
            std::fstream copy(m_copy, std::ios::binary | std::ios::in | std::ios::out);
            copy.seekp(static_cast<std::streamoff>((table.rootPage - 1) * m_pageSize));
            copy.write(m_bytes.data() + page * m_pageSize, static_cast<std::streamsize>(m_pageSize));
        }
        try {
            SQLite::Database database = openDamaged(m_copy);
            Rows found;
            TableReader(database, table.name).walk("", found);
            rows.merge(found);
        } catch (const SQLite::Exception &) {
            // Not a page of this table.
        }
    }

    std::string m_copy;
    std::string m_bytes;
    std::size_t m_pageSize = 0;
};

std::size_t columnCount(SQLite::Database &database, const std::string &table) {
    SQLite::Statement query(database, "SELECT * FROM " + quoted(table));
    return static_cast<std::size_t>(query.getColumnCount());
}

int copyTables(const std::string &damaged, SQLite::Database &target) {
    SQLite::Database source = openDamaged(damaged);
    int copied = 0;
    for (const Table &table : readTables(source)) {
        if (!writeTo(target, [&] { target.exec(table.definition); }))
            continue;
        Rows rows;
        if (!TableReader(source, table.name).run(rows))
            PageScan(damaged).read(table, columnCount(target, table.name), rows);
        copied += writeRows(target, table.name, rows);
    }
    return copied;
}

} // namespace

int copyReadableRows(const std::string &damaged, SQLite::Database &target) {
    SQLite::Transaction transaction(target);
    int copied = 0;
    try {
        copied = copyTables(damaged, target);
    } catch (const SQLite::Exception &) {
        // No database at all.
    }
    transaction.commit();
    return copied;
}

} // namespace StoreRescue
