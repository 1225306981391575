// "portGroups": the port groups of the standard switches; names are unique
// on the host, and each group's switch is in "standardSwitches".

#include <set>

#include <nlohmann/json.hpp>

#include "host/description/SwitchingSections.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

void PortGroupsSection::Parse(const JsonReader& value) {
    std::set<std::string> names;
    for (const JsonReader& element : value.Elements()) {
        PortGroupRecord group = PortGroupRecord::FromJson(element);
        if (!names.insert(group.name).second)
            element.Member("name").Fail("duplicate port group \"" + group.name + "\"");
        groups_.push_back(group);
        paths_.push_back(element.Path());
    }
}

void PortGroupsSection::CheckReferences(const ParsedDescription& description) const {
    const auto& switches = description.Get<StandardSwitchesSection>();
    for (std::size_t i = 0; i < groups_.size(); ++i)
        if (switches.Find(groups_[i].vswitch) == nullptr)
            throw DescriptionError(paths_[i] + ".vswitch: no standard switch \"" + groups_[i].vswitch + "\"");
}

void PortGroupsSection::Write(Transaction& t) const {
    for (const PortGroupRecord& group : groups_) t.Put(group);
}

Json PortGroupsSection::Export(const Transaction& t) const {
    Json groups = Json::array();
    for (const PortGroupRecord& group : t.List<PortGroupRecord>()) groups.push_back(group.ToJson());
    return groups;
}

void PortGroupsSection::AddCopy(HostCopy& copy, Json& value) const {
    for (PortGroupRecord group : groups_) {
        group.name = copy.Name(PortGroupRecord::kKind, group.name);
        group.vswitch = copy.Name(StandardSwitchRecord::kKind, group.vswitch);
        CopyUplinkOrder(copy, group.policies);
        value.push_back(group.ToJson());
    }
}

const PortGroupRecord* PortGroupsSection::Find(const std::string& name) const {
    for (const PortGroupRecord& group : groups_)
        if (group.name == name) return &group;
    return nullptr;
}

namespace {
const SectionRegistration kPortGroups("portGroups", 50, [] { return std::make_unique<PortGroupsSection>(); });
}  // namespace

}  // namespace Host
}  // namespace Trellis
