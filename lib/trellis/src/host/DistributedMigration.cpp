// The step that brings running VMs and distributed switches to a host made
// before they existed: the default host's worlds, a world for each VM whose
// adapter has a port, and, where nothing of the host stands in their way,
// the default host's distributed switches with their NICs and ports.

#include "host/DistributedMigration.h"

#include <algorithm>
#include <optional>
#include <set>

#include <nlohmann/json.hpp>

#include "host/description/DescriptionIo.h"
#include "trellis/host/records/DVSwitchRecords.h"
#include "trellis/host/records/PnicRecord.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/host/records/WorldRecord.h"

namespace Trellis {
namespace Host {

namespace {

// The VM's name in an adapter's name ("web01.eth0" -> "web01").
std::string VmOfAdapter(const std::string& clientName) { return clientName.substr(0, clientName.rfind('.')); }

void AddWorldsOfAdapters(Transaction& t) {
    for (auto& entry : t.ListData(PortRecord::kKind)) {
        Json& port = entry.second;
        if (port.value("clientKind", "") != "vmAdapter" || port.contains("worldId")) continue;
        const std::string vm = VmOfAdapter(port.value("clientName", ""));
        std::int64_t worldId = 0;
        std::int64_t highest = 0;
        for (const WorldRecord& world : t.List<WorldRecord>()) {
            if (world.vmName == vm) worldId = world.id;
            highest = std::max(highest, world.id);
        }
        if (worldId == 0) {
            WorldRecord world;
            world.id = highest + 1;
            world.name = std::to_string(world.id);
            world.vmName = vm;
            t.Put(world);
            worldId = world.id;
        }
        port["worldId"] = worldId;
        t.PutData(PortRecord::kKind, entry.first, port, port.value("portset", ""));
    }
}

// Whether the default's distributed switches fit: no switch of their names,
// no NIC of theirs on a standard switch, no port id of theirs taken.
bool DistributedSwitchesFit(const Transaction& t, const Json& defaults) {
    std::set<std::string> uplinks;
    for (const StandardSwitchRecord& vswitch : t.List<StandardSwitchRecord>())
        uplinks.insert(vswitch.uplinks.begin(), vswitch.uplinks.end());
    for (const Json& dvs : defaults.value("distributedSwitches", Json::array())) {
        if (t.ContainsData(StandardSwitchRecord::kKind, dvs.value("name", ""))) return false;
        for (const Json& port : dvs.value("ports", Json::array()))
            if (uplinks.count(port.value("nic", "")) != 0) return false;
    }
    // A port of theirs that an earlier step seeded already is theirs.
    for (const Json& port : defaults.value("ports", Json::array())) {
        if (!port.contains("dvPort")) continue;
        std::optional<Json> taken = t.FindData(PortRecord::kKind, std::to_string(port.value("id", 0)));
        if (taken && *taken != PortRecord::FromJson(JsonReader(&port, "ports")).ToJson()) return false;
    }
    return true;
}

}  // namespace

void MigrateToDistributedSwitches(Transaction& t) {
    const Json& defaults = DefaultDescription();
    // A host that has worlds or distributed switches of its own keeps them.
    if (t.Count<WorldRecord>() == 0) WriteSectionOfDefault(t, "worlds");
    AddWorldsOfAdapters(t);
    if (t.Count<DVSwitchRecord>() > 0 || !DistributedSwitchesFit(t, defaults)) return;
    for (const Json& nic : defaults.value("nics", Json::array())) {
        const std::string name = nic.value("name", "");
        if (!t.ContainsData(PnicRecord::kKind, name))
            t.Put(PnicRecord::FromJson(JsonReader(&nic, "nics")));
    }
    WriteSectionOfDefault(t, "distributedSwitches");
    for (const Json& port : defaults.value("ports", Json::array()))
        if (port.contains("dvPort")) t.Put(PortRecord::FromJson(JsonReader(&port, "ports")));
}

}  // namespace Host
}  // namespace Trellis
