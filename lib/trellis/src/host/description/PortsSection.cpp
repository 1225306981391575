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
#include "trellis/host/records/PnicRecord.h"
#include "trellis/host/records/TslNicRecord.h"

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
    const auto& distributed = description.Get<DistributedSwitchesSection>();
    const auto& groups = description.Get<PortGroupsSection>();
    const auto& worlds = description.Get<WorldsSection>();
    std::map<std::string, int> used;
    std::set<std::string> uplinkPorts;  // switch and NIC of every uplink's port
    std::set<std::string> busyDvPorts;
    for (std::size_t i = 0; i < ports_.size(); ++i) {
        const PortRecord& port = ports_[i];
        const std::string& at = paths_[i];
        auto fail = [&](const std::string& field, const std::string& problem) {
            throw DescriptionError(at + (field.empty() ? "" : "." + field) + ": " + problem);
        };
        int numPorts = 0;
        std::vector<std::string> uplinks;
        if (const StandardSwitchRecord* vswitch = switches.Find(port.portset)) {
            numPorts = vswitch->numPorts;
            uplinks = vswitch->uplinks;
            if (!port.dvPort.empty()) fail("dvPort", "\"" + port.portset + "\" is a standard switch");
            const PortGroupRecord* group = groups.Find(port.portGroup);
            if (port.clientKind != PortClientKind::Uplink && (group == nullptr || group->vswitch != port.portset))
                fail("portGroup", "no port group \"" + port.portGroup + "\" on \"" + port.portset + "\"");
            if (port.clientKind == PortClientKind::Uplink &&
                std::find(uplinks.begin(), uplinks.end(), port.clientName) == uplinks.end())
                fail("clientName", "\"" + port.clientName + "\" is no uplink of \"" + port.portset + "\"");
        } else if (const DVSwitchRecord* dvs = distributed.Find(port.portset)) {
            numPorts = dvs->numPorts;
            if (port.dvPort.empty()) fail("dvPort", "expected the DVPort on \"" + port.portset + "\"");
            const DVPortRecord* dvPort = distributed.FindPort(port.portset, port.dvPort);
            if (dvPort == nullptr) fail("dvPort", "no DVPort " + port.dvPort + " on \"" + port.portset + "\"");
            if (port.clientKind == PortClientKind::Uplink && dvPort->nic != port.clientName)
                fail("clientName", "DVPort " + port.dvPort + " has no NIC \"" + port.clientName + "\"");
            if (port.clientKind != PortClientKind::Uplink && dvPort->IsUplink())
                fail("dvPort", "DVPort " + port.dvPort + " is an uplink port");
            if (!busyDvPorts.insert(port.portset + "/" + port.dvPort).second)
                fail("dvPort", "DVPort " + port.dvPort + " is already in use");
            uplinks.clear();  // the distributed switch's uplinks have DVPorts of their own
        } else {
            fail("portset", "no switch \"" + port.portset + "\"");
        }
        if (port.clientKind == PortClientKind::Uplink) {
            if (!uplinkPorts.insert(port.portset + "/" + port.clientName).second)
                fail("clientName", "\"" + port.clientName + "\" already has a port");
            continue;  // counted among the switch's uplinks
        }
        if (port.clientKind == PortClientKind::VmAdapter) {
            const WorldRecord* world = worlds.Find(port.worldId);
            if (world == nullptr || world->system) fail("worldId", "no VM's world " + std::to_string(port.worldId));
            if (port.clientName.rfind(world->vmName + ".", 0) != 0)
                fail("clientName", "expected an adapter of \"" + world->vmName + "\" (\"" + world->vmName + ".eth0\")");
        }
        auto count = used.emplace(port.portset, static_cast<int>(uplinks.size())).first;
        if (++count->second > numPorts)
            fail("", "\"" + port.portset + "\" has no free port left (" + std::to_string(numPorts) + " ports)");
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
constexpr const char* kVmNames = kVmNameFamily;

// A VM adapter is named by its VM, a point and the adapter: the VM is copied,
// the adapter keeps its name ("web01.eth0" -> "web02.eth0").
std::string CopiedClientName(HostCopy& copy, const PortRecord& port) {
    if (port.clientKind == PortClientKind::TesselNic) return copy.Name(kInterfaceNames, port.clientName);
    if (port.clientKind == PortClientKind::Uplink) return copy.Name(PnicRecord::kKind, port.clientName);
    std::size_t point = port.clientName.rfind('.');
    if (point == std::string::npos) return copy.Name(kVmNames, port.clientName);
    return copy.Name(kVmNames, port.clientName.substr(0, point)) + port.clientName.substr(point);
}

}  // namespace

void PortsSection::AddCopy(HostCopy& copy, Json& value) const {
    for (PortRecord port : ports_) {
        port.name = copy.Name(PortRecord::kKind, port.name);
        port.id = std::stoll(port.name);
        const bool distributed = !port.dvPort.empty();
        port.portset = copy.Name(distributed ? DVSwitchRecord::kKind : StandardSwitchRecord::kKind, port.portset);
        if (!port.portGroup.empty()) port.portGroup = copy.Name(PortGroupRecord::kKind, port.portGroup);
        if (port.worldId != 0) port.worldId = std::stoll(copy.Name(WorldRecord::kKind, std::to_string(port.worldId)));
        if (!port.teamUplink.empty()) port.teamUplink = copy.Name(PnicRecord::kKind, port.teamUplink);
        for (std::string& mac : port.macAddresses) mac = copy.Mac(mac);
        if (!port.ipv4Address.empty()) port.ipv4Address = copy.Ipv4(port.ipv4Address);
        port.clientName = CopiedClientName(copy, port);
        // A host has 256 interface names: the copies past them have no interfaces.
        if (port.clientKind == PortClientKind::TesselNic && TslNicRecord::NumberOf(port.clientName) < 0) continue;
        value.push_back(port.ToJson());
    }
}

int PortsSection::PortsOn(const std::string& vswitch) const {
    return static_cast<int>(std::count_if(ports_.begin(), ports_.end(), [&](const PortRecord& port) {
        return port.portset == vswitch && port.clientKind != PortClientKind::Uplink;
    }));
}

const PortRecord* PortsSection::InterfacePort(const std::string& name) const {
    for (const PortRecord& port : ports_)
        if (port.clientKind == PortClientKind::TesselNic && port.clientName == name) return &port;
    return nullptr;
}

namespace {
const SectionRegistration kPorts("ports", 80, [] { return std::make_unique<PortsSection>(); });
}  // namespace

}  // namespace Host
}  // namespace Trellis
