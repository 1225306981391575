#pragma once

// A thin RAII layer over the SQLite C API: one connection, prepared
// statements with positional binding, and errors as SqliteError. A connection
// keeps the statements it prepared once and hands them out again, reset, for
// the same SQL text: every host operation runs the same few queries, and
// preparing them anew each time would cost more than running them.

#include <cstdint>
#include <optional>
#include <stdexcept>
#include <string>
#include <unordered_map>

struct sqlite3;
struct sqlite3_stmt;

namespace Trellis {
namespace Host {

class SqliteError : public std::runtime_error {
public:
    SqliteError(int code, const std::string& message) : std::runtime_error(message), code_(code) {}
    // The primary result code (SQLITE_BUSY, SQLITE_CORRUPT, SQLITE_NOTADB...).
    int Code() const { return code_ & 0xff; }

private:
    int code_;
};

class Statement;

class Database {
public:
    enum class Mode { ReadOnly, ReadWrite, ReadWriteCreate };

    Database(const std::string& path, Mode mode);
    ~Database();
    Database(const Database&) = delete;
    Database& operator=(const Database&) = delete;

    // Runs one or more statements that return no rows of interest.
    void Execute(const std::string& sql);
    // How long a statement waits for a lock that another connection holds.
    void SetBusyTimeout(int milliseconds);
    Statement Prepare(const std::string& sql);
    // The first column of the first row of a query that returns one integer.
    std::int64_t QueryInt(const std::string& sql);
    // Rows changed by the last INSERT, UPDATE or DELETE.
    int Changes() const;
    bool InTransaction() const;
    // The change counter in the header of the database file, as the file
    // holds it now, read without a lock. In rollback journal mode every
    // commit of any connection changes it before the commit completes, so
    // a reader that saw a value under a lock and sees it again knows that
    // nothing was committed in between.
    std::uint32_t FileChangeCounter();

    [[noreturn]] void Fail(int code, const std::string& what) const;

private:
    friend class Statement;
    // A prepared statement for sql: an idle one kept from before, or a new one.
    sqlite3_stmt* Acquire(const std::string& sql);
    // Takes back a statement that is done, reset, for the next Acquire of sql.
    void Release(const std::string& sql, sqlite3_stmt* stmt);

    sqlite3* db_ = nullptr;
    std::unordered_map<std::string, sqlite3_stmt*> idle_;
};

class Statement {
public:
    Statement(Database& db, const std::string& sql);
    ~Statement();
    Statement(Statement&& other) noexcept;
    Statement(const Statement&) = delete;
    Statement& operator=(const Statement&) = delete;
    Statement& operator=(Statement&&) = delete;

    // Binding is by position, from 1.
    Statement& Bind(int index, const std::string& value);
    Statement& Bind(int index, std::int64_t value);
    Statement& Bind(int index, int value) { return Bind(index, static_cast<std::int64_t>(value)); }
    Statement& BindNull(int index);
    template <class T>
    Statement& Bind(int index, const std::optional<T>& value) {
        return value ? Bind(index, *value) : BindNull(index);
    }

    // Advances to the next row; false when there is none left.
    bool Step();
    // Runs a statement that returns no rows.
    void Run();

    std::string Text(int column) const;
    std::int64_t Int(int column) const;
    bool IsNull(int column) const;

private:
    Database* db_;
    std::string sql_;
    sqlite3_stmt* stmt_ = nullptr;
};

}  // namespace Host
}  // namespace Trellis
