#pragma once

// The store's layout and its versions.
//
// PRAGMA application_id marks a file as a host store; PRAGMA user_version is
// its schema version. A new host is created at the latest version: the
// tables of version 1 in the current layout, then the default description.
// An older one is brought up to date on open, in one transaction: first its
// tables are given the current layout, then the migration steps after its
// version fill in the data. The layout comes first because every step writes
// records as this build does, with the columns this build knows.
//
// To add a step (say, switches join the host): append
//   {3, "switches", [](Transaction& t) { SeedSection(t, "switches"); }}
// to the list in Schema.cpp. The latest version follows the list. A step must
// work on any store of the version before it and must not assume that the
// user left the default inventory alone. A new column or index goes into
// UpgradeTableLayout, which must leave a table already in that layout alone.

#include <cstdint>
#include <vector>

namespace Trellis {
namespace Host {

class Database;
class Transaction;

constexpr std::int32_t kHostApplicationId = 0x48616c64;  // "Hald"

struct Migration {
    int version;              // the version the step brings the store to
    const char* description;  // what it adds
    void (*apply)(Transaction& t);
};

// Every step, in order of version; the first has version 2.
const std::vector<Migration>& Migrations();
int LatestSchemaVersion();

// Creates the tables of version 1, the bare store, with no records.
void CreateBaseSchema(Database& db);
// Brings the tables of any version to the current layout: records gains its
// parent column and the index on (kind, parent).
void UpgradeTableLayout(Database& db);
// The names of the tables of version 1, which every store has.
const std::vector<const char*>& BaseTables();

// Imports the section key of the default description into a host that lacks it.
void SeedSection(Transaction& t, const char* key);

}  // namespace Host
}  // namespace Trellis
