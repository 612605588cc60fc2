#pragma once

#include <cstdint>
#include <filesystem>
#include <memory>
#include <stdexcept>
#include <string>
#include <string_view>

struct sqlite3;
struct sqlite3_stmt;

namespace emulator {

class DatabaseError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// One connection to an SQLite file; for one thread at a time. Everything throws DatabaseError on failure, a
/// file that cannot be made std::runtime_error.
class Database {
public:
    /// Makes the file, readable by its owner only, where there is none.
    explicit Database(const std::filesystem::path &path);
    ~Database();
    Database(const Database &) = delete;
    Database &operator=(const Database &) = delete;

    void run(const char *sql);
    sqlite3 *handle() const { return m_handle; }

private:
    sqlite3 *m_handle = nullptr;
};

/// A prepared statement, reusable after reset.
class Statement {
public:
    Statement(const Database &database, const char *sql);
    ~Statement();
    Statement(const Statement &) = delete;
    Statement &operator=(const Statement &) = delete;

    /// Values go to the parameters in order. Texts are not copied: they must live until the next reset.
    Statement &bind(std::int64_t value);
    Statement &bind(std::string_view text);

    /// True while there is a row.
    bool step();
    /// Runs a statement without rows and makes it ready for the next values.
    void run();
    void reset();

    std::int64_t integer(int column) const;
    std::string text(int column) const;

private:
    [[noreturn]] void fail();

    sqlite3 *m_database;
    sqlite3_stmt *m_statement = nullptr;
    int m_bound = 0;
};

/// A transaction that is undone unless committed; one inside another belongs to the outer one.
class Transaction {
public:
    explicit Transaction(Database &database);
    ~Transaction();
    Transaction(const Transaction &) = delete;
    Transaction &operator=(const Transaction &) = delete;

    void commit();

private:
    Database &m_database;
    bool m_outermost;
    bool m_open = true;
};

} // namespace emulator
