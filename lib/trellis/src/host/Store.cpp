#include "host/Store.h"

#include <filesystem>

#include <sqlite3.h>

#include "host/HostCreation.h"
#include "host/Schema.h"
#include "trellis/host/HostSession.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

namespace {

constexpr int kBusyTimeoutMs = 10000;

[[noreturn]] void Refuse(const std::string& path, const std::string& problem) {
    throw HostOpenError("Cannot open the host " + path + ": " + problem);
}

std::string Describe(const SqliteError& e) {
    switch (e.Code()) {
        case SQLITE_NOTADB: return "it is not a host store (" + std::string(e.what()) + ")";
        case SQLITE_CORRUPT: return "the host store is damaged (" + std::string(e.what()) + ")";
        default: return e.what();
    }
}

bool HasTable(Database& db, const char* table) {
    Statement query = db.Prepare("SELECT 1 FROM sqlite_master WHERE type = 'table' AND name = ?");
    query.Bind(1, table);
    return query.Step();
}

// Only reads, so that a file that is refused is left as it was. Returns the
// store's schema version.
std::int64_t CheckIsHostStore(const std::string& path, Database& db) {
    if (db.QueryInt("PRAGMA application_id") != kHostApplicationId) Refuse(path, "it is not a host store");
    std::int64_t version = db.QueryInt("PRAGMA user_version");
    if (version < 1) Refuse(path, "it is not a host store (no schema version)");
    if (version > LatestSchemaVersion())
        Refuse(path, "it was written by a newer version (schema " + std::to_string(version) +
                         ", this build knows up to " + std::to_string(LatestSchemaVersion()) + ")");
    // One query answers for a store that is whole.
    if (db.QueryInt("SELECT count(*) FROM sqlite_master WHERE type = 'table' AND name IN ('records', 'faults', "
                    "'exec_log')") != static_cast<std::int64_t>(BaseTables().size())) {
        for (const char* table : BaseTables())
            if (!HasTable(db, table))
                Refuse(path, std::string("the host store is damaged (table ") + table + " is missing)");
    }
    return version;
}

}  // namespace

Store::Store(std::string path, std::unique_ptr<Database> db)
    : path_(std::move(path)), db_(std::move(db)), faults_(*db_) {}

std::unique_ptr<Store> Store::Open(const std::string& path) {
    std::string file = std::filesystem::path(path).filename().string();
    if (file.empty() || file == "." || file == "..") Refuse(path, "the path names a directory, not a file");
    std::error_code error;
    // What a killed creator left is removed when the host is next created or
    // replaced: an open of a host that exists writes nothing.
    if (!std::filesystem::exists(path, error)) {
        RemoveAbandonedTemporaries(path);
        CreateHostFile(path);
    }
    std::unique_ptr<Database> db;
    try {
        db = std::make_unique<Database>(path, Database::Mode::ReadWrite);
    } catch (const SqliteError& e) {
        Refuse(path, e.what());
    }
    std::unique_ptr<Store> store;
    try {
        db->SetBusyTimeout(kBusyTimeoutMs);
        // The checks read in one transaction: one lock taken and given back
        // instead of one for each. A refusal leaves it to the closing.
        db->Execute("BEGIN");
        std::int64_t version = CheckIsHostStore(path, *db);
        db->Execute("COMMIT");
        // A rollback journal, kept as an empty file between changes: reading
        // the host then writes nothing at all, where a write-ahead log would
        // create and remove its two files at every open.
        db->Execute("PRAGMA journal_mode = TRUNCATE; PRAGMA synchronous = FULL");
        store = std::make_unique<Store>(path, std::move(db));
        if (version != LatestSchemaVersion()) store->Migrate();
        store->faults_.Reload();
    } catch (const SqliteError& e) {
        Refuse(path, Describe(e));
    } catch (const Gantry::Lib::GantryException& e) {
        Refuse(path, e.what());
    } catch (const DescriptionError& e) {
        Refuse(path, std::string("its migration failed: ") + e.what());
    }
    return store;
}

void Store::Hold() {
    if (held_) return;
    GuardedSql(*this, [&] {
        db_->Execute("PRAGMA locking_mode = EXCLUSIVE");
        try {
            // An exclusive transaction takes the write lock at once, so that
            // two holders never each keep a read lock the other waits for.
            db_->Execute("BEGIN EXCLUSIVE; COMMIT");
        } catch (const SqliteError&) {
            db_->Execute("PRAGMA locking_mode = NORMAL");
            throw;
        }
        // Another process may have armed a fault since the host was opened.
        faults_.RefreshIfChanged();
    });
    held_ = true;
    faults_.SetHeld(true);
}

void Store::Release() {
    if (!held_) return;
    held_ = false;
    faults_.SetHeld(false);
    GuardedSql(*this, [&] {
        db_->Execute("PRAGMA locking_mode = NORMAL");
        // The lock goes at the next access to the file: a read of a statement
        // the open prepared already.
        db_->QueryInt("PRAGMA user_version");
    });
}

void Store::Migrate() {
    TransactionScope scope(*this, true);
    // Read again under the write lock: another process may have migrated meanwhile.
    std::int64_t version = db_->QueryInt("PRAGMA user_version");
    UpgradeTableLayout(*db_);
    for (const Migration& step : Migrations()) {
        if (step.version <= version) continue;
        step.apply(scope.Get());
        db_->Execute("PRAGMA user_version = " + std::to_string(step.version));
    }
    scope.Commit();
}

}  // namespace Host
}  // namespace Trellis
