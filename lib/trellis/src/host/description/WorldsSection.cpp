// "worlds": the running VMs, each a world id and the VM's name. Both are
// unique on the host.

#include <set>

#include <nlohmann/json.hpp>

#include "host/description/SwitchingSections.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

void WorldsSection::Parse(const JsonReader& value) {
    std::set<std::string> names;
    for (const JsonReader& element : value.Elements()) {
        WorldRecord world = WorldRecord::FromJson(element);
        if (Find(world.id) != nullptr) element.Member("id").Fail("duplicate world " + world.name);
        if (!names.insert(world.vmName).second) element.Member("name").Fail("duplicate VM \"" + world.vmName + "\"");
        worlds_.push_back(world);
    }
}

void WorldsSection::Write(Transaction& t) const {
    for (const WorldRecord& world : worlds_) t.Put(world);
}

Json WorldsSection::Export(const Transaction& t) const {
    Json worlds = Json::array();
    for (const WorldRecord& world : t.List<WorldRecord>()) worlds.push_back(world.ToJson());
    return worlds;
}

void WorldsSection::AddCopy(HostCopy& copy, Json& value) const {
    for (WorldRecord world : worlds_) {
        world.name = copy.Name(WorldRecord::kKind, world.name);
        world.id = std::stoll(world.name);
        world.vmName = copy.Name(kVmNameFamily, world.vmName);
        value.push_back(world.ToJson());
    }
}

const WorldRecord* WorldsSection::Find(std::int64_t id) const {
    for (const WorldRecord& world : worlds_)
        if (world.id == id) return &world;
    return nullptr;
}

namespace {
const SectionRegistration kWorlds("worlds", 70, [] { return std::make_unique<WorldsSection>(); });
}  // namespace

}  // namespace Host
}  // namespace Trellis
