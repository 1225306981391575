// "tesselNics": the kernel interfaces. Names and MAC addresses are unique on
// the host; each interface's netstack exists; one attached to a port group or
// a DVPort holds its port there (a port of "ports" whose client is the
// interface), and a DVPort's interface is no uplink's; a static IPv4 address
// is unique in its netstack. A port of a kernel interface that this section
// does not list is left as it is.

#include <map>
#include <set>

#include <nlohmann/json.hpp>

#include "host/description/InterfaceSections.h"
#include "host/description/SwitchingSections.h"
#include "trellis/host/Transaction.h"

namespace Trellis {
namespace Host {

namespace {
constexpr const char* kInterfaceNames = "tesselNic";  // as the ports' clients are copied
constexpr const char* kOpaqueNetworks = "opaqueNetwork";
}  // namespace

void TesselNicsSection::Parse(const JsonReader& value) {
    std::set<std::string> names;
    std::set<std::string> macs;
    std::map<std::string, std::string> addresses;  // netstack and address -> interface
    for (const JsonReader& element : value.Elements()) {
        TslNicRecord nic = TslNicRecord::FromJson(element);
        if (!names.insert(nic.name).second) element.Member("name").Fail("duplicate interface \"" + nic.name + "\"");
        if (!macs.insert(nic.macAddress).second)
            element.Member("macAddress").Fail("duplicate MAC address " + nic.macAddress);
        if (nic.ipv4Mode == Ipv4Mode::Static) {
            auto taken = addresses.emplace(nic.netstack + " " + nic.ipv4Address, nic.name);
            if (!taken.second)
                element.Member("ipv4").Fail("interface " + taken.first->second + " of netstack " + nic.netstack +
                                            " has the address " + nic.ipv4Address + " already");
        }
        nics_.push_back(nic);
        paths_.push_back(element.Path());
    }
}

void TesselNicsSection::CheckReferences(const ParsedDescription& description) const {
    const auto& netstacks = description.Get<NetstacksSection>();
    const auto& groups = description.Get<PortGroupsSection>();
    const auto& distributed = description.Get<DistributedSwitchesSection>();
    const auto& ports = description.Get<PortsSection>();
    for (std::size_t i = 0; i < nics_.size(); ++i) {
        const TslNicRecord& nic = nics_[i];
        auto fail = [&](const std::string& field, const std::string& problem) {
            throw DescriptionError(paths_[i] + "." + field + ": " + problem);
        };
        if (!netstacks.Contains(nic.netstack)) fail("netstack", "no netstack \"" + nic.netstack + "\"");
        const ConnectionRecord& point = nic.connection;
        const PortRecord* port = ports.InterfacePort(nic.name);
        if (point.kind == ConnectionKind::PortGroup) {
            const PortGroupRecord* group = groups.Find(point.portGroup);
            if (group == nullptr) fail("connectionPoint.portGroup", "no port group \"" + point.portGroup + "\"");
            if (port == nullptr || port->portset != group->vswitch || port->portGroup != group->name)
                fail("connectionPoint", "no port of \"" + nic.name + "\" in \"" + group->name + "\" (section ports)");
        } else if (point.kind == ConnectionKind::DVPort) {
            if (distributed.Find(point.dvSwitch) == nullptr)
                fail("connectionPoint.dvSwitch", "no distributed switch \"" + point.dvSwitch + "\"");
            const DVPortRecord* dvPort = distributed.FindPort(point.dvSwitch, point.dvPort);
            if (dvPort == nullptr) fail("connectionPoint.dvPort", "no DVPort " + point.dvPort + " on \"" + point.dvSwitch + "\"");
            if (port == nullptr || port->portset != point.dvSwitch || port->dvPort != point.dvPort)
                fail("connectionPoint", "no port of \"" + nic.name + "\" on DVPort " + point.dvPort + " (section ports)");
        } else if (port != nullptr) {
            fail("connectionPoint", "\"" + nic.name + "\" has a port on \"" + port->portset + "\" but no connection point there");
        }
    }
}

void TesselNicsSection::Write(Transaction& t) const {
    for (const TslNicRecord& nic : nics_) t.Put(nic);
}

Json TesselNicsSection::Export(const Transaction& t) const {
    Json nics = Json::array();
    for (const TslNicRecord& nic : t.List<TslNicRecord>()) nics.push_back(nic.ToJson());
    return nics;
}

void TesselNicsSection::AddCopy(HostCopy& copy, Json& value) const {
    for (TslNicRecord nic : nics_) {
        nic.name = copy.Name(kInterfaceNames, nic.name);
        if (TslNicRecord::NumberOf(nic.name) < 0) continue;  // past tsl255, as the ports section does
        nic.macAddress = copy.Mac(nic.macAddress);
        ConnectionRecord& point = nic.connection;
        if (point.kind == ConnectionKind::PortGroup) point.portGroup = copy.Name(PortGroupRecord::kKind, point.portGroup);
        if (point.kind == ConnectionKind::DVPort) point.dvSwitch = copy.Name(DVSwitchRecord::kKind, point.dvSwitch);
        if (point.kind == ConnectionKind::OpaqueNetwork) point.networkId = copy.Name(kOpaqueNetworks, point.networkId);
        if (nic.ipv4Mode == Ipv4Mode::Static) nic.ipv4Address = copy.Ipv4(nic.ipv4Address);
        for (Ipv6AddressRecord& address : nic.ipv6Addresses) address.network = copy.Ipv6(address.network);
        value.push_back(nic.ToJson());
    }
}

std::string TesselNicsSection::NetstackOf(const std::string& name) const {
    for (const TslNicRecord& nic : nics_)
        if (nic.name == name) return nic.netstack;
    return "";
}

namespace {
const SectionRegistration kTesselNics("tesselNics", 85, [] { return std::make_unique<TesselNicsSection>(); });
}  // namespace

}  // namespace Host
}  // namespace Trellis
