#include "host/Schema.h"

#include <string>

#include "host/Sqlite.h"
#include "host/description/DescriptionIo.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

const std::vector<Migration>& Migrations() {
    static const std::vector<Migration> steps = {
        {2, "kernel modules and the firewall",
         [](Transaction& t) {
             SeedSection(t, "modules");
             SeedSection(t, "firewall");
         }},
        {3, "physical NICs, standard switches, port groups and the ports in use",
         [](Transaction& t) {
             SeedSection(t, "nics");
             SeedSection(t, "standardSwitches");
             SeedSection(t, "portGroups");
             SeedSection(t, "ports");
         }},
    };
    return steps;
}

int LatestSchemaVersion() {
    return Migrations().empty() ? 1 : Migrations().back().version;
}

const std::vector<const char*>& BaseTables() {
    static const std::vector<const char*> tables = {"records", "faults", "exec_log"};
    return tables;
}

void CreateBaseSchema(Database& db) {
    db.Execute("PRAGMA application_id = " + std::to_string(kHostApplicationId) + ";"
               "CREATE TABLE records ("
               "  kind TEXT NOT NULL,"
               "  name TEXT NOT NULL,"
               "  data TEXT NOT NULL,"  // the record as JSON
               "  UNIQUE (kind, name));"
               // Ordered by (kind, rowid): lists one kind in the order of first storing.
               "CREATE INDEX records_by_kind ON records (kind);"
               "CREATE TABLE faults ("
               "  operation TEXT NOT NULL UNIQUE,"
               "  message TEXT,"
               "  status INTEGER,"
               "  remaining INTEGER);"  // NULL: every call
               "CREATE TABLE exec_log ("
               "  id INTEGER PRIMARY KEY,"
               "  command_line TEXT NOT NULL,"
               "  options TEXT NOT NULL,"  // the three flags, as a JSON array
               "  status INTEGER NOT NULL);"
               "PRAGMA user_version = 1;");
}

void SeedSection(Transaction& t, const char* key) {
    WriteSectionOfDefault(t, key);
}

}  // namespace Host
}  // namespace Trellis
