#include "tables/database.h"

#include "http/utf8path.h"
#include "platform.h"

#include <sqlite3.h>

namespace emulator {

namespace {

// The cost of a lock that a reader from outside holds for a moment.
constexpr int busyMs = 5000;

} // namespace

Database::Database(const std::filesystem::path &path) {
    platform::makePrivateFile(path);
    if (sqlite3_open_v2(utf8(path).c_str(), &m_handle, SQLITE_OPEN_READWRITE | SQLITE_OPEN_NOMUTEX,
                        nullptr) != SQLITE_OK) {
        sqlite3_close(m_handle);
        throw DatabaseError("cannot open " + utf8(path));
    }
    sqlite3_busy_timeout(m_handle, busyMs);
}

Database::~Database() {
    sqlite3_close_v2(m_handle);
}

void Database::run(const char *sql) {
    if (sqlite3_exec(m_handle, sql, nullptr, nullptr, nullptr) != SQLITE_OK)
        throw DatabaseError(std::string("the store refuses: ") + sqlite3_errmsg(m_handle));
}

Statement::Statement(const Database &database, const char *sql) : m_database(database.handle()) {
    if (sqlite3_prepare_v3(m_database, sql, -1, SQLITE_PREPARE_PERSISTENT, &m_statement, nullptr) !=
        SQLITE_OK)
        fail();
}

Statement::~Statement() {
    sqlite3_finalize(m_statement);
}

Statement &Statement::bind(std::int64_t value) {
    if (sqlite3_bind_int64(m_statement, ++m_bound, value) != SQLITE_OK)
        fail();
    return *this;
}

Statement &Statement::bind(std::string_view text) {
    const char *data = text.data() ? text.data() : "";
    if (sqlite3_bind_text64(m_statement, ++m_bound, data, text.size(), nullptr, SQLITE_UTF8) != SQLITE_OK)
        fail();
    return *this;
}

bool Statement::step() {
    const int result = sqlite3_step(m_statement);
    if (result != SQLITE_ROW && result != SQLITE_DONE)
        fail();
    return result == SQLITE_ROW;
}

void Statement::run() {
    step();
    reset();
}

void Statement::reset() {
    sqlite3_reset(m_statement);
    m_bound = 0;
}

std::int64_t Statement::integer(int column) const {
    return sqlite3_column_int64(m_statement, column);
}

std::string Statement::text(int column) const {
    const void *data = sqlite3_column_blob(m_statement, column);
    const auto size = static_cast<std::size_t>(sqlite3_column_bytes(m_statement, column));
    return data ? std::string(static_cast<const char *>(data), size) : std::string();
}

void Statement::fail() {
    const std::string why = sqlite3_errmsg(m_database);
    // A statement that failed must not keep its lock or its values for the next use.
    reset();
    throw DatabaseError("the store refuses: " + why);
}

Transaction::Transaction(Database &database)
    : m_database(database), m_outermost(sqlite3_get_autocommit(database.handle()) != 0) {
    if (m_outermost)
        m_database.run("BEGIN IMMEDIATE");
}

Transaction::~Transaction() {
    if (m_outermost && m_open)
        sqlite3_exec(m_database.handle(), "ROLLBACK", nullptr, nullptr, nullptr);
}

void Transaction::commit() {
    if (m_outermost)
        m_database.run("COMMIT");
    m_open = false;
}

} // namespace emulator
