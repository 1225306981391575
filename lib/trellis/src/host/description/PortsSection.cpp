// "ports": the ports in use by clients (kernel interfaces, VM adapters).
// Each port's switch and port group exist and belong together, and no switch
// has more ports in use (clients and uplinks) than it has ports.

#include <algorithm>
#include <map>
#include <set>
#include <string>

#include <nlohmann/json.hpp>

#include "host/description/SwitchingSections.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

void PortsSection::Parse(const JsonReader& value) {
    std::set<std::int64_t> ids;
    for (const JsonReader& element : value.Elements()) {
        PortRecord port = PortRecord::FromJson(element);
        if (!ids.insert(port.id).second) element.Member("id").Fail("duplicate port " + port.name);
        ports_.push_back(port);
        paths_.push_back(element.Path());
    }
}

void PortsSection::CheckReferences(const ParsedDescription& description) const {
    const auto& switches = description.Get<StandardSwitchesSection>();
    const auto& groups = description.Get<PortGroupsSection>();
    std::map<std::string, int> used;
    for (std::size_t i = 0; i < ports_.size(); ++i) {
        const PortRecord& port = ports_[i];
        const StandardSwitchRecord* vswitch = switches.Find(port.portset);
        if (vswitch == nullptr)
            throw DescriptionError(paths_[i] + ".portset: no standard switch \"" + port.portset + "\"");
        const PortGroupRecord* group = groups.Find(port.portGroup);
        if (group == nullptr || group->vswitch != port.portset)
            throw DescriptionError(paths_[i] + ".portGroup: no port group \"" + port.portGroup + "\" on \"" +
                                   port.portset + "\"");
        auto count = used.emplace(port.portset, static_cast<int>(vswitch->uplinks.size())).first;
        if (++count->second > vswitch->numPorts)
            throw DescriptionError(paths_[i] + ": \"" + port.portset + "\" has no free port left (" +
                                   std::to_string(vswitch->numPorts) + " ports)");
    }
}

void PortsSection::Write(Transaction& t) const {
    for (const PortRecord& port : ports_) t.Put(port);
}

Json PortsSection::Export(const Transaction& t) const {
    Json ports = Json::array();
    for (const PortRecord& port : t.List<PortRecord>()) ports.push_back(port.ToJson());
    return ports;
}

namespace {

// The families of the names of the ports' clients, shared with the sections
// of kernel interfaces and VMs when they join, so that their copies match.
constexpr const char* kInterfaceNames = "tesselNic";
constexpr const char* kVmNames = "vm";

// A VM adapter is named by its VM, a point and the adapter: the VM is copied,
// the adapter keeps its name ("web01.eth0" -> "web02.eth0").
std::string CopiedClientName(HostCopy& copy, const PortRecord& port) {
    if (port.clientKind == PortClientKind::TesselNic) return copy.Name(kInterfaceNames, port.clientName);
    std::size_t point = port.clientName.rfind('.');
    if (point == std::string::npos) return copy.Name(kVmNames, port.clientName);
    return copy.Name(kVmNames, port.clientName.substr(0, point)) + port.clientName.substr(point);
}

}  // namespace

void PortsSection::AddCopy(HostCopy& copy, Json& value) const {
    for (PortRecord port : ports_) {
        port.name = copy.Name(PortRecord::kKind, port.name);
        port.id = std::stoll(port.name);
        port.portset = copy.Name(StandardSwitchRecord::kKind, port.portset);
        port.portGroup = copy.Name(PortGroupRecord::kKind, port.portGroup);
        port.clientName = CopiedClientName(copy, port);
        value.push_back(port.ToJson());
    }
}

int PortsSection::PortsOn(const std::string& vswitch) const {
    return static_cast<int>(
        std::count_if(ports_.begin(), ports_.end(), [&](const PortRecord& port) { return port.portset == vswitch; }));
}

namespace {
const SectionRegistration kPorts("ports", 80, [] { return std::make_unique<PortsSection>(); });
}  // namespace

}  // namespace Host
}  // namespace Trellis
