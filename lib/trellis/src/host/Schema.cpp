#include "host/Schema.h"

#include <string>

#include "host/DistributedMigration.h"
#include "host/InterfaceMigration.h"
#include "host/IpServicesMigration.h"
#include "host/NicDeviceMigration.h"
#include "host/RoutingMigration.h"
#include "host/Sqlite.h"
#include "host/description/DescriptionIo.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/DVSwitchRecords.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/SwitchRecords.h"

namespace Trellis {
namespace Host {

namespace {

// Writes every record of the kind again, which stores its parent.
template <class R>
void StoreParents(Transaction& t) {
    for (const R& record : t.List<R>()) t.Put(record);
}

}  // namespace

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
        {4, "the parent of every port group, port and DVPort, found through an index",
         [](Transaction& t) {
             StoreParents<PortGroupRecord>(t);
             StoreParents<PortRecord>(t);
             StoreParents<DVPortRecord>(t);
         }},
        {5, "running VMs, distributed switches, and the VMs, addresses and counters of the ports in use",
         [](Transaction& t) { MigrateToDistributedSwitches(t); }},
        {6, "netstack instances and kernel interfaces", [](Transaction& t) { MigrateToKernelInterfaces(t); }},
        {7, "the host's IPv6 switch and the routing of its netstacks", [](Transaction& t) { MigrateToRouting(t); }},
        {8, "name servers, connections, the host's own worlds and IPsec", [](Transaction& t) { MigrateToIpServices(t); }},
        {9, "the NICs' devices: PCI devices, link settings, diagnostics, counters, tuning and SR-IOV",
         [](Transaction& t) { MigrateToNicDevices(t); }},
        // The change is the table layout's: the index of kinds alone goes.
        {10, "the names of a kind read from the index of names, not from the records", [](Transaction&) {}},
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

void UpgradeTableLayout(Database& db) {
    if (db.QueryInt("SELECT count(*) FROM pragma_table_info('records') WHERE name = 'parent'") == 0)
        db.Execute("ALTER TABLE records ADD COLUMN parent TEXT");  // the name of the object it belongs to
    db.Execute("CREATE INDEX IF NOT EXISTS records_by_parent ON records (kind, parent)");
    // Records of one kind are found through the index of (kind, name), which
    // also holds every name and rowid: listing the names of a kind reads no
    // record, where an index of kinds alone made it read each one.
    db.Execute("DROP INDEX IF EXISTS records_by_kind");
}

void SeedSection(Transaction& t, const char* key) {
    WriteSectionOfDefault(t, key);
}

}  // namespace Host
}  // namespace Trellis
