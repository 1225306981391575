#include "host/Sqlite.h"

#include <sqlite3.h>

#include <utility>

namespace Trellis {
namespace Host {

namespace {

// Set before the library's first use. A command reads a handful of pages, so
// the page cache takes them one by one instead of twenty at once, each
// written to at its first use.
void ConfigureLibrary() {
    static bool const configured = [] {
        sqlite3_config(SQLITE_CONFIG_PAGECACHE, nullptr, 0, 0);
        return true;
    }();
    (void)configured;
}

}  // namespace

Database::Database(const std::string& path, Mode mode) {
    ConfigureLibrary();
    int flags = SQLITE_OPEN_NOMUTEX;
    switch (mode) {
        case Mode::ReadOnly: flags |= SQLITE_OPEN_READONLY; break;
        case Mode::ReadWrite: flags |= SQLITE_OPEN_READWRITE; break;
        case Mode::ReadWriteCreate: flags |= SQLITE_OPEN_READWRITE | SQLITE_OPEN_CREATE; break;
    }
    int rc = sqlite3_open_v2(path.c_str(), &db_, flags, nullptr);
    if (rc != SQLITE_OK) {
        std::string message = db_ ? sqlite3_errmsg(db_) : sqlite3_errstr(rc);
        sqlite3_close_v2(db_);
        db_ = nullptr;
        throw SqliteError(rc, message);
    }
    sqlite3_extended_result_codes(db_, 1);
}

Database::~Database() {
    for (auto& entry : idle_) sqlite3_finalize(entry.second);
    sqlite3_close_v2(db_);
}

sqlite3_stmt* Database::Acquire(const std::string& sql) {
    auto idle = idle_.find(sql);
    if (idle != idle_.end()) {
        sqlite3_stmt* stmt = idle->second;
        idle_.erase(idle);
        return stmt;
    }
    sqlite3_stmt* stmt = nullptr;
    int rc = sqlite3_prepare_v2(db_, sql.c_str(), static_cast<int>(sql.size()), &stmt, nullptr);
    if (rc != SQLITE_OK) Fail(rc, "");
    return stmt;
}

void Database::Release(const std::string& sql, sqlite3_stmt* stmt) {
    sqlite3_reset(stmt);
    sqlite3_clear_bindings(stmt);
    // A second statement of the same text, used while the first was out, is not kept.
    if (!idle_.emplace(sql, stmt).second) sqlite3_finalize(stmt);
}

void Database::Fail(int code, const std::string& what) const {
    std::string message = sqlite3_errmsg(db_);
    throw SqliteError(code, what.empty() ? message : what + ": " + message);
}

void Database::Execute(const std::string& sql) {
    int rc = sqlite3_exec(db_, sql.c_str(), nullptr, nullptr, nullptr);
    if (rc != SQLITE_OK) Fail(rc, "");
}

Statement Database::Prepare(const std::string& sql) {
    return Statement(*this, sql);
}

std::int64_t Database::QueryInt(const std::string& sql) {
    Statement statement(*this, sql);
    if (!statement.Step()) throw SqliteError(SQLITE_ERROR, "No result from: " + sql);
    return statement.Int(0);
}

void Database::SetBusyTimeout(int milliseconds) {
    int rc = sqlite3_busy_timeout(db_, milliseconds);
    if (rc != SQLITE_OK) Fail(rc, "PRAGMA busy_timeout");
}

int Database::Changes() const {
    return sqlite3_changes(db_);
}

bool Database::InTransaction() const {
    return sqlite3_get_autocommit(db_) == 0;
}

std::uint32_t Database::FileChangeCounter() {
    constexpr int kCounterOffset = 24;  // in the database header
    sqlite3_file* file = nullptr;
    int rc = sqlite3_file_control(db_, "main", SQLITE_FCNTL_FILE_POINTER, &file);
    if (rc != SQLITE_OK || file == nullptr || file->pMethods == nullptr)
        throw SqliteError(rc == SQLITE_OK ? SQLITE_ERROR : rc, "The database file cannot be read");
    unsigned char bytes[4];
    rc = file->pMethods->xRead(file, bytes, sizeof bytes, kCounterOffset);
    // A file too short to hold a header reads as zeros: a store not written yet.
    if (rc != SQLITE_OK && rc != SQLITE_IOERR_SHORT_READ)
        throw SqliteError(rc, "The header of the database file cannot be read");
    return std::uint32_t{bytes[0]} << 24 | std::uint32_t{bytes[1]} << 16 | std::uint32_t{bytes[2]} << 8 | bytes[3];
}

Statement::Statement(Database& db, const std::string& sql) : db_(&db), sql_(sql), stmt_(db.Acquire(sql)) {}

Statement::~Statement() {
    if (stmt_) db_->Release(sql_, stmt_);
}

Statement::Statement(Statement&& other) noexcept
    : db_(other.db_), sql_(std::move(other.sql_)), stmt_(other.stmt_) {
    other.stmt_ = nullptr;
}

Statement& Statement::Bind(int index, const std::string& value) {
    int rc = sqlite3_bind_text(stmt_, index, value.data(), static_cast<int>(value.size()), SQLITE_TRANSIENT);
    if (rc != SQLITE_OK) db_->Fail(rc, "");
    return *this;
}

Statement& Statement::Bind(int index, std::int64_t value) {
    int rc = sqlite3_bind_int64(stmt_, index, value);
    if (rc != SQLITE_OK) db_->Fail(rc, "");
    return *this;
}

Statement& Statement::BindNull(int index) {
    int rc = sqlite3_bind_null(stmt_, index);
    if (rc != SQLITE_OK) db_->Fail(rc, "");
    return *this;
}

bool Statement::Step() {
    int rc = sqlite3_step(stmt_);
    if (rc == SQLITE_ROW) return true;
    if (rc == SQLITE_DONE) return false;
    db_->Fail(rc, "");
}

void Statement::Run() {
    while (Step()) {
    }
}

std::string Statement::Text(int column) const {
    const unsigned char* text = sqlite3_column_text(stmt_, column);
    int size = sqlite3_column_bytes(stmt_, column);
    return text ? std::string(reinterpret_cast<const char*>(text), static_cast<std::size_t>(size)) : std::string();
}

std::int64_t Statement::Int(int column) const {
    return sqlite3_column_int64(stmt_, column);
}

bool Statement::IsNull(int column) const {
    return sqlite3_column_type(stmt_, column) == SQLITE_NULL;
}

}  // namespace Host
}  // namespace Trellis
