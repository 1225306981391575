// "distributedSwitches": the distributed switches the host takes part in,
// each with its ports ("ports", the DVPorts) nested in it. Switch names are
// unique across standard and distributed switches, identities across the
// distributed ones; a NIC is connected to one uplink port of one switch at
// most and never to a standard switch as well; LAG ports are named after
// their LAG.

#include <map>
#include <set>

#include <nlohmann/json.hpp>

#include "host/description/SwitchingSections.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/PnicRecord.h"

namespace Trellis {
namespace Host {

namespace {
// The families of copied names that are no record kind.
constexpr const char* kDvsIds = "dvsId";
constexpr const char* kDvPortGroupIds = "dvPortGroupId";
}  // namespace

void DistributedSwitchesSection::Parse(const JsonReader& value) {
    std::set<std::string> names;
    std::set<std::string> ids;
    std::map<std::string, std::string> switchOfNic;
    for (const JsonReader& element : value.Elements()) {
        Entry entry{DVSwitchRecord::FromJson(element), {}, element.Path()};
        const DVSwitchRecord& vswitch = entry.vswitch;
        if (!names.insert(vswitch.name).second) element.Member("name").Fail("duplicate switch \"" + vswitch.name + "\"");
        if (!ids.insert(vswitch.id).second) element.Member("id").Fail("duplicate identity \"" + vswitch.id + "\"");
        std::set<std::string> portIds;
        std::set<std::string> uplinkNames;
        for (const JsonReader& portElement : element.Array("ports")) {
            DVPortRecord port = DVPortRecord::FromDescription(portElement, vswitch.name, vswitch.id);
            if (!portIds.insert(port.portId).second) portElement.Member("id").Fail("duplicate port " + port.portId);
            if (port.IsUplink() && !uplinkNames.insert(port.uplinkName).second)
                portElement.Member("uplinkName").Fail("duplicate uplink \"" + port.uplinkName + "\"");
            if (!port.nic.empty()) {
                auto taken = switchOfNic.emplace(port.nic, vswitch.name);
                if (!taken.second)
                    portElement.Member("nic").Fail("\"" + port.nic + "\" is already connected to \"" +
                                                   taken.first->second + "\"");
            }
            entry.ports.push_back(port);
        }
        if (static_cast<int>(entry.ports.size()) > vswitch.numPorts)
            element.Member("ports").Fail("more ports than the switch's " + std::to_string(vswitch.numPorts));
        for (const LagRecord& lag : vswitch.lags)
            for (const DVPortRecord& port : entry.ports)
                if (port.uplinkName.rfind(lag.name + "-", 0) == 0) {
                    const std::string index = port.uplinkName.substr(lag.name.size() + 1);
                    if (index.empty() || index.find_first_not_of("0123456789") != std::string::npos ||
                        index.size() > 2 || std::stoul(index) >= lag.uplinkCount)
                        element.Member("ports").Fail("uplink \"" + port.uplinkName + "\" is no port of LAG \"" +
                                                     lag.name + "\" (ports " + lag.name + "-0 to " +
                                                     std::to_string(lag.uplinkCount) + " less one)");
                }
        switches_.push_back(std::move(entry));
    }
}

void DistributedSwitchesSection::CheckReferences(const ParsedDescription& description) const {
    const auto& standard = description.Get<StandardSwitchesSection>();
    for (const Entry& entry : switches_) {
        if (standard.Find(entry.vswitch.name) != nullptr)
            throw DescriptionError(entry.path + ".name: a standard switch is named \"" + entry.vswitch.name + "\"");
        const std::map<std::string, std::string> uplinks = standard.Uplinks();
        for (const DVPortRecord& port : entry.ports) {
            auto other = uplinks.find(port.nic);
            if (!port.nic.empty() && other != uplinks.end())
                throw DescriptionError(entry.path + ".ports: \"" + port.nic + "\" is already an uplink of \"" +
                                       other->second + "\"");
        }
    }
}

void DistributedSwitchesSection::Write(Transaction& t) const {
    for (const Entry& entry : switches_) {
        t.Put(entry.vswitch);
        for (const DVPortRecord& port : entry.ports) t.Put(port);
    }
}

Json DistributedSwitchesSection::Export(const Transaction& t) const {
    Json switches = Json::array();
    for (const DVSwitchRecord& vswitch : t.List<DVSwitchRecord>()) {
        Json value = vswitch.ToJson();
        Json ports = Json::array();
        for (const DVPortRecord& port : t.ChildrenOf<DVPortRecord>(vswitch.name))
            ports.push_back(port.ToDescriptionJson());
        value["ports"] = ports;
        switches.push_back(value);
    }
    return switches;
}

void DistributedSwitchesSection::AddCopy(HostCopy& copy, Json& value) const {
    for (const Entry& entry : switches_) {
        DVSwitchRecord vswitch = entry.vswitch;
        vswitch.name = copy.Name(DVSwitchRecord::kKind, vswitch.name);
        vswitch.id = copy.Name(kDvsIds, vswitch.id);
        for (LacpGroupRecord& group : vswitch.lacpGroups)
            for (LacpNicRecord& nic : group.nics) nic.name = copy.Name(PnicRecord::kKind, nic.name);
        Json copied = vswitch.ToJson();
        Json ports = Json::array();
        for (DVPortRecord port : entry.ports) {
            port.portGroupId = copy.Name(kDvPortGroupIds, port.portGroupId);
            if (!port.nic.empty()) port.nic = copy.Name(PnicRecord::kKind, port.nic);
            ports.push_back(port.ToDescriptionJson());
        }
        copied["ports"] = ports;
        value.push_back(copied);
    }
}

const DVSwitchRecord* DistributedSwitchesSection::Find(const std::string& name) const {
    for (const Entry& entry : switches_)
        if (entry.vswitch.name == name) return &entry.vswitch;
    return nullptr;
}

const DVPortRecord* DistributedSwitchesSection::FindPort(const std::string& dvswitch, const std::string& portId) const {
    for (const Entry& entry : switches_)
        if (entry.vswitch.name == dvswitch)
            for (const DVPortRecord& port : entry.ports)
                if (port.portId == portId) return &port;
    return nullptr;
}

namespace {
const SectionRegistration kDistributedSwitches("distributedSwitches", 60,
                                               [] { return std::make_unique<DistributedSwitchesSection>(); });
}  // namespace

}  // namespace Host
}  // namespace Trellis
