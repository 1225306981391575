#include "SwitchStore.h"

#include <algorithm>
#include <cstdint>

#include "DVSwitchStore.h"
#include "PolicyInheritance.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"

namespace Trellis {
namespace Network {
namespace SwitchStore {

using Trellis::Host::PortGroupRecord;
using Trellis::Host::PortRecord;
using Trellis::Host::StandardSwitchRecord;
using Trellis::Host::Transaction;

void Refuse(std::string const& message) { throw Gantry::Lib::GantryException(message); }

void RequireStorableName(std::string const& name, std::string const& refusal) {
    std::string problem = Trellis::Host::TextProblem(name);
    if (!problem.empty()) Refuse(refusal + "its name " + problem);
}

StandardSwitchRecord RequireSwitch(Transaction const& t, std::string const& name) {
    std::optional<StandardSwitchRecord> vswitch = t.Find<StandardSwitchRecord>(name);
    if (!vswitch) Refuse("Virtual switch " + Trellis::Host::Printable(name) + " does not exist");
    return *vswitch;
}

PortGroupRecord RequirePortGroup(Transaction const& t, std::string const& name) {
    std::optional<PortGroupRecord> group = t.Find<PortGroupRecord>(name);
    if (!group) Refuse("Port group " + Trellis::Host::Printable(name) + " does not exist");
    return *group;
}

std::vector<PortGroupRecord> PortGroupsOf(Transaction const& t, std::string const& vswitch) {
    return t.ChildrenOf<PortGroupRecord>(vswitch);
}

std::int64_t ClientPortsOf(Transaction const& t, std::string const& vswitch) {
    return static_cast<std::int64_t>(t.CountChildrenOf<PortRecord>(vswitch)) -
           static_cast<std::int64_t>(t.CountChildrenWith<PortRecord>(vswitch, "clientKind", "uplink"));
}

std::int64_t ActiveClientsOf(Transaction const& t, PortGroupRecord const& group) {
    return static_cast<std::int64_t>(t.CountChildrenWith<PortRecord>(group.vswitch, "portGroup", group.name));
}

int UsedPortsOf(Transaction const& t, StandardSwitchRecord const& vswitch) {
    return static_cast<int>(ClientPortsOf(t, vswitch.name) + static_cast<std::int64_t>(vswitch.uplinks.size()));
}

int ConfiguredPortsOnHost(Transaction const& t) {
    int total = 0;
    for (StandardSwitchRecord const& vswitch : t.List<StandardSwitchRecord>()) total += vswitch.numPorts;
    return total;
}

std::optional<std::string> SwitchOfUplink(Transaction const& t, std::string const& nic) {
    for (StandardSwitchRecord const& vswitch : t.List<StandardSwitchRecord>())
        if (std::find(vswitch.uplinks.begin(), vswitch.uplinks.end(), nic) != vswitch.uplinks.end())
            return "virtual switch " + vswitch.name;
    std::string distributed = DVSwitchStore::SwitchOfNic(t, nic);
    if (!distributed.empty()) return "distributed switch " + distributed;
    return std::nullopt;
}

std::int64_t NewPortId(Transaction const& t) {
    std::int64_t highest = kFirstPortId - 1;
    for (std::string const& name : t.Names<PortRecord>()) highest = std::max<std::int64_t>(highest, std::stoll(name));
    if (highest >= INT32_MAX) Refuse("Unable to connect a port: the host has no port id left");
    return highest + 1;
}

std::optional<PortRecord> UplinkPortOf(Transaction const& t, std::string const& vswitch, std::string const& nic) {
    for (PortRecord& port : t.ChildrenOf<PortRecord>(vswitch))
        if (port.clientKind == Trellis::Host::PortClientKind::Uplink && port.clientName == nic) return std::move(port);
    return std::nullopt;
}

void AddUplinkPort(Transaction& t, std::string const& vswitch, std::string const& nic) {
    PortRecord port;
    port.id = NewPortId(t);
    port.name = std::to_string(port.id);
    port.portset = vswitch;
    port.clientKind = Trellis::Host::PortClientKind::Uplink;
    port.clientName = nic;
    t.Put(port);
}

void RemoveUplinkPorts(Transaction& t, std::string const& vswitch, std::optional<std::string> const& nic) {
    for (PortRecord const& port : t.ChildrenOf<PortRecord>(vswitch))
        if (port.clientKind == Trellis::Host::PortClientKind::Uplink && (!nic || port.clientName == *nic))
            t.Erase<PortRecord>(port.name);
}

Trellis::Host::StoredPolicies PortGroupPolicies(Transaction const& t, PortGroupRecord const& group) {
    return PortGroupPoliciesInForce(SwitchPoliciesInForce(RequireSwitch(t, group.vswitch)), group);
}

Gantry::Network::NicTeamingPolicy StorableTeamingPolicy(Gantry::Network::NicTeamingPolicy policy,
                                                        std::string const& owner) {
    using Gantry::Network::NicTeamingPolicy;
    auto value = static_cast<std::uint32_t>(policy.teamPolicy);
    if ((policy.setMask & NicTeamingPolicy::MASK_TEAM_POLICY) != 0 && (value < 1 || value > 4))
        Refuse("Invalid load balancing policy " + std::to_string(value) + " for " + owner);
    if ((policy.setMask & NicTeamingPolicy::MASK_UPLINK_ORDER) != 0)
        for (std::string const& uplink : policy.uplinkOrder)
            RequireStorableName(uplink, "Invalid uplink " + Trellis::Host::Printable(uplink) +
                                            " in the teaming policy of " + owner + ": ");
    policy.setMask &= ~NicTeamingPolicy::MASK_RESERVED0;
    policy.reserved0 = false;
    return policy;
}

Gantry::Network::ShapingPolicy StorableShapingPolicy(Gantry::Network::ShapingPolicy const& policy,
                                                     std::string const& owner) {
    using Gantry::Network::ShapingPolicy;
    struct Value {
        std::uint32_t bit;
        std::uint64_t value;
        const char* what;
    };
    for (Value const& v : {Value{ShapingPolicy::MASK_AVERAGE_BPS, policy.averageBps, "average bandwidth"},
                           Value{ShapingPolicy::MASK_PEAK_BPS, policy.peakBps, "peak bandwidth"},
                           Value{ShapingPolicy::MASK_BURST_SIZE, policy.burstSize, "burst size"}}) {
        if ((policy.setMask & v.bit) != 0 && v.value > static_cast<std::uint64_t>(INT64_MAX))
            Refuse("Invalid " + std::string(v.what) + " " + std::to_string(v.value) + " for " + owner +
                   ": the host keeps at most " + std::to_string(INT64_MAX) +
                   (v.bit == ShapingPolicy::MASK_BURST_SIZE ? " bytes" : " bits per second"));
    }
    return policy;
}

}  // namespace SwitchStore
}  // namespace Network
}  // namespace Trellis
