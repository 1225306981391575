#pragma once

#include <memory>
#include <string>

#include "host/FaultBook.h"
#include "gantry/lib/GantryException.h"
#include "host/Sqlite.h"

namespace Trellis {
namespace Host {

// One open host store: its connection and its armed faults.
class Store {
public:
    // Opens the host store at path, creating it with the default inventory
    // when it does not exist, and migrates an older one. Refuses (HostOpenError)
    // a file that is not a host store or is newer than this build, without
    // writing to it.
    static std::unique_ptr<Store> Open(const std::string& path);

    // A store on a connection that the caller has set up (creation).
    Store(std::string path, std::unique_ptr<Database> db);

    const std::string& Path() const { return path_; }
    Database& Db() { return *db_; }
    FaultBook& Faults() { return faults_; }
    bool InTransaction() const { return db_->InTransaction(); }

    // Holds the store's lock from now until Release: the operations in
    // between take and drop no lock of their own, and other processes wait
    // (up to the busy timeout) until the release. Hold throws
    // GantryException when the lock cannot be had; both do nothing when
    // there is nothing to do.
    void Hold();
    void Release();

private:
    void Migrate();

    std::string path_;
    std::unique_ptr<Database> db_;
    FaultBook faults_;
    bool held_ = false;
};

// Runs fn(), turning a failure of SQLite into the GantryException that
// callers of host operations expect.
template <class Fn>
auto GuardedSql(const Store& store, Fn&& fn) {
    try {
        return fn();
    } catch (const SqliteError& e) {
        throw Gantry::Lib::GantryException("The host store " + store.Path() + " failed: " + e.what());
    }
}

// The store that OpenHost opened; GantryException "No host is open" if none.
Store& CurrentStore();

}  // namespace Host
}  // namespace Trellis
