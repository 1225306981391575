#pragma once

#include <cstdint>
#include <map>
#include <optional>
#include <string>
#include <vector>

#include "trellis/host/Faults.h"

namespace Trellis {
namespace Host {

class Database;

// The faults table of one store, with a cache of the armed faults so that an
// operation without a fault costs one read of the database file's change
// counter, without a lock: the cache is read again only when a connection
// has committed since.
class FaultBook {
public:
    explicit FaultBook(Database& db) : db_(db) {}

    // The fault that fires for this call of operation, if one is armed; a
    // counted fault is counted down in the store, in its own transaction, so
    // that concurrent processes fire it exactly `remaining` times in all.
    // Must be called outside a transaction.
    std::optional<Fault> Hit(const std::string& operation);

    // After this connection changed the faults table by other means.
    void Reload();
    // Reads the faults again when a connection has committed since they were read.
    void RefreshIfChanged();

    // While the store is held, no other connection can change the faults:
    // the cache stands without looking at the file.
    void SetHeld(bool held) { held_ = held; }

    void Arm(const Fault& fault);
    void Clear();
    std::vector<Fault> List();

    // Within a transaction that the caller holds (host descriptions).
    static std::vector<Fault> Read(Database& db);
    static void Write(Database& db, const std::vector<Fault>& faults);

private:

    Database& db_;
    bool loaded_ = false;
    bool held_ = false;
    std::uint32_t changeCounter_ = 0;  // of the file, when the cache was read
    std::map<std::string, Fault> armed_;
};

}  // namespace Host
}  // namespace Trellis
