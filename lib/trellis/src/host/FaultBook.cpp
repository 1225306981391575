#include "host/FaultBook.h"

#include "host/Sqlite.h"

namespace Trellis {
namespace Host {

namespace {

Fault FaultFromRow(const Statement& row) {
    Fault fault;
    fault.operation = row.Text(0);
    fault.message = row.Text(1);
    fault.status = static_cast<int>(row.Int(2));
    if (!row.IsNull(3)) fault.remaining = static_cast<int>(row.Int(3));
    return fault;
}

// Holds BEGIN IMMEDIATE .. COMMIT on a bare connection; rolls back if left early.
class ImmediateTransaction {
public:
    explicit ImmediateTransaction(Database& db) : db_(db) { db_.Execute("BEGIN IMMEDIATE"); }
    ~ImmediateTransaction() {
        if (db_.InTransaction()) {
            try { db_.Execute("ROLLBACK"); } catch (...) {}
        }
    }
    void Commit() { db_.Execute("COMMIT"); }

private:
    Database& db_;
};

// Holds BEGIN .. COMMIT on a bare connection, the shared lock taken by the
// first read; ends it if left early.
class ReadTransaction {
public:
    explicit ReadTransaction(Database& db) : db_(db) { db_.Execute("BEGIN"); }
    ~ReadTransaction() {
        if (db_.InTransaction()) {
            try { db_.Execute("ROLLBACK"); } catch (...) {}
        }
    }
    void End() { db_.Execute("COMMIT"); }

private:
    Database& db_;
};

}  // namespace

std::vector<Fault> FaultBook::Read(Database& db) {
    std::vector<Fault> faults;
    Statement query = db.Prepare("SELECT operation, message, status, remaining FROM faults ORDER BY rowid");
    while (query.Step()) faults.push_back(FaultFromRow(query));
    return faults;
}

void FaultBook::Write(Database& db, const std::vector<Fault>& faults) {
    for (const Fault& fault : faults) {
        db.Prepare("INSERT INTO faults (operation, message, status, remaining) VALUES (?, ?, ?, ?)"
                   " ON CONFLICT (operation) DO UPDATE SET message = excluded.message,"
                   " status = excluded.status, remaining = excluded.remaining")
            .Bind(1, fault.operation)
            .Bind(2, fault.message)
            .Bind(3, fault.status)
            .Bind(4, fault.remaining)
            .Run();
    }
}

void FaultBook::Reload() {
    // One read transaction, so that the counter is the one of the faults read.
    ReadTransaction transaction(db_);
    std::vector<Fault> faults = Read(db_);
    changeCounter_ = db_.FileChangeCounter();
    transaction.End();
    armed_.clear();
    for (Fault& fault : faults) armed_[fault.operation] = std::move(fault);
    loaded_ = true;
}

void FaultBook::RefreshIfChanged() {
    if (!loaded_ || (!held_ && db_.FileChangeCounter() != changeCounter_)) Reload();
}

std::optional<Fault> FaultBook::Hit(const std::string& operation) {
    RefreshIfChanged();
    auto it = armed_.find(operation);
    if (it == armed_.end()) return std::nullopt;
    if (!it->second.remaining) return it->second;

    // Counted: take one hit in the store, where other processes count too.
    std::optional<Fault> fired;
    {
        ImmediateTransaction transaction(db_);
        Statement query =
            db_.Prepare("SELECT operation, message, status, remaining FROM faults WHERE operation = ?");
        query.Bind(1, operation);
        if (query.Step()) {
            fired = FaultFromRow(query);
            if (fired->remaining && *fired->remaining > 1) {
                db_.Prepare("UPDATE faults SET remaining = remaining - 1 WHERE operation = ?").Bind(1, operation).Run();
            } else if (fired->remaining) {
                db_.Prepare("DELETE FROM faults WHERE operation = ?").Bind(1, operation).Run();
            }
        }
        transaction.Commit();
    }
    Reload();
    return fired;
}

void FaultBook::Arm(const Fault& fault) {
    ImmediateTransaction transaction(db_);
    Write(db_, {fault});
    transaction.Commit();
    Reload();
}

void FaultBook::Clear() {
    db_.Execute("DELETE FROM faults");
    Reload();
}

std::vector<Fault> FaultBook::List() {
    return Read(db_);
}

}  // namespace Host
}  // namespace Trellis
