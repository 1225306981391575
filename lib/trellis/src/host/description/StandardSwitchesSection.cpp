// "standardSwitches": the host's standard switches, as a list of switch
// records. An uplink stands on one switch at most; the configured ports of
// all switches stay within the host's limit. An uplink need not name a NIC
// of the "nics" section: a NIC that went away stays listed by its switch
// (the tools hide it).

#include <algorithm>
#include <map>
#include <set>

#include <nlohmann/json.hpp>

#include "host/description/SwitchingSections.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/PnicRecord.h"

namespace Trellis {
namespace Host {

void StandardSwitchesSection::Parse(const JsonReader& value) {
    std::set<std::string> names;
    std::map<std::string, std::string> switchOfUplink;
    int totalPorts = 0;
    for (const JsonReader& element : value.Elements()) {
        StandardSwitchRecord vswitch = StandardSwitchRecord::FromJson(element);
        if (!names.insert(vswitch.name).second)
            element.Member("name").Fail("duplicate switch \"" + vswitch.name + "\"");
        for (const std::string& uplink : vswitch.uplinks) {
            auto taken = switchOfUplink.emplace(uplink, vswitch.name);
            if (!taken.second)
                element.Member("uplinks").Fail("\"" + uplink + "\" is already an uplink of \"" + taken.first->second + "\"");
        }
        totalPorts += vswitch.numPorts;
        if (totalPorts > SwitchLimits::kMaxPortsPerHost)
            element.Member("numPorts").Fail("the switches have more than " +
                                            std::to_string(SwitchLimits::kMaxPortsPerHost) + " ports in all");
        switches_.push_back(vswitch);
    }
}

void StandardSwitchesSection::Write(Transaction& t) const {
    for (const StandardSwitchRecord& vswitch : switches_) t.Put(vswitch);
}

Json StandardSwitchesSection::Export(const Transaction& t) const {
    Json switches = Json::array();
    for (const StandardSwitchRecord& vswitch : t.List<StandardSwitchRecord>()) switches.push_back(vswitch.ToJson());
    return switches;
}

// The host's configured ports are shared among the copies. Where a copy's
// switches would take more than its share, each keeps the ports it uses and
// gets a part of what is left of the share, in proportion to the ports it
// has beyond those.
void StandardSwitchesSection::AddCopy(HostCopy& copy, Json& value) const {
    const PortsSection& ports = copy.Original().Get<PortsSection>();
    auto usedPorts = [&](const StandardSwitchRecord& vswitch) {
        return static_cast<int>(vswitch.uplinks.size()) + ports.PortsOn(vswitch.name);
    };
    int configured = 0;
    int used = 0;
    for (const StandardSwitchRecord& vswitch : switches_) {
        configured += vswitch.numPorts;
        used += usedPorts(vswitch);
    }
    const int share =
        copy.Copies() == 0 ? configured : (SwitchLimits::kMaxPortsPerHost - configured) / copy.Copies();
    for (StandardSwitchRecord vswitch : switches_) {
        if (configured > share) {
            const int inUse = usedPorts(vswitch);
            const int spare = std::max(share - used, 0);
            const int extra = configured == used ? 0 : (vswitch.numPorts - inUse) * spare / (configured - used);
            vswitch.numPorts = std::max(SwitchLimits::kMinPorts, inUse + extra);
        }
        vswitch.name = copy.Name(StandardSwitchRecord::kKind, vswitch.name);
        for (std::string& uplink : vswitch.uplinks) uplink = copy.Name(PnicRecord::kKind, uplink);
        CopyUplinkOrder(copy, vswitch.policies);
        value.push_back(vswitch.ToJson());
    }
}

void CopyUplinkOrder(HostCopy& copy, StoredPolicies& policies) {
    for (std::string& uplink : policies.teaming.uplinkOrder) uplink = copy.Name(PnicRecord::kKind, uplink);
}

std::map<std::string, std::string> StandardSwitchesSection::Uplinks() const {
    std::map<std::string, std::string> uplinks;
    for (const StandardSwitchRecord& vswitch : switches_)
        for (const std::string& uplink : vswitch.uplinks) uplinks.emplace(uplink, vswitch.name);
    return uplinks;
}

const StandardSwitchRecord* StandardSwitchesSection::Find(const std::string& name) const {
    for (const StandardSwitchRecord& vswitch : switches_)
        if (vswitch.name == name) return &vswitch;
    return nullptr;
}

namespace {
const SectionRegistration kStandardSwitches("standardSwitches", 40,
                                            [] { return std::make_unique<StandardSwitchesSection>(); });
}  // namespace

}  // namespace Host
}  // namespace Trellis
