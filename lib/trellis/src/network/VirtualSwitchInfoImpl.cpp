#include "trellis/network/VirtualSwitchInfoImpl.h"

#include <optional>
#include <utility>

#include "DVSwitchStore.h"
#include "SwitchStore.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/network/DVSwitchImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::PortGroupRecord;
using Trellis::Host::StandardSwitchRecord;
using Trellis::Host::SwitchLimits;
using Trellis::Host::Transaction;

const Operation kConstruct("VirtualSwitchInfoImpl::VirtualSwitchInfoImpl");
const Operation kAddVirtualSwitchWithPolicy("VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy");
const Operation kGetVirtualSwitches("VirtualSwitchInfoImpl::GetVirtualSwitches");
const Operation kGetVirtualSwitchByName("VirtualSwitchInfoImpl::GetVirtualSwitchByName");
const Operation kRemoveVirtualSwitch("VirtualSwitchInfoImpl::RemoveVirtualSwitch");
const Operation kGetDVSwitches("VirtualSwitchInfoImpl::GetDVSwitches");
const Operation kGetAllSwitches("VirtualSwitchInfoImpl::GetAllSwitches");
const Operation kIsLegacySwitch("VirtualSwitchInfoImpl::IsLegacySwitch");
const Operation kGetDVSwitchByName("VirtualSwitchInfoImpl::GetDVSwitchByName");

std::vector<Gantry::Network::DVSwitch*> DVSwitchesOf(Transaction const& t) {
    std::vector<Gantry::Network::DVSwitch*> switches;
    for (Trellis::Host::DVSwitchRecord& record : t.List<Trellis::Host::DVSwitchRecord>()) {
        std::vector<std::string> uplinks = DVSwitchStore::UplinksOf(t, record.name);
        switches.push_back(new DVSwitchImpl(std::move(record), std::move(uplinks)));
    }
    return switches;
}

}  // namespace

VirtualSwitchInfoImpl::VirtualSwitchInfoImpl() { kConstruct.Check(); }

VirtualSwitchInfoImpl::~VirtualSwitchInfoImpl() {}

// The simulated host has no offloads to configure on a switch: the
// capabilities are taken and not kept.
Gantry::Network::VirtualSwitch* VirtualSwitchInfoImpl::AddVirtualSwitchWithPolicy(
    Gantry::Network::NicTeamingPolicy const& teaming, Gantry::Network::PortSecurityPolicy const& security,
    Gantry::Network::ShapingPolicy const& shaping, Gantry::Network::NicCapabilities const& /*capabilities*/,
    std::string const& name, int numPorts) {
    StandardSwitchRecord created = kAddVirtualSwitchWithPolicy.Write([&](Transaction& t) {
        const std::string refusal = "Unable to create virtual switch " + Trellis::Host::Printable(name) + ": ";
        if (name.empty()) SwitchStore::Refuse("Unable to create a virtual switch: its name must not be empty");
        SwitchStore::RequireStorableName(name, refusal);
        if (t.Contains<StandardSwitchRecord>(name))
            SwitchStore::Refuse(refusal + "a virtual switch of that name already exists");
        if (t.Contains<Trellis::Host::DVSwitchRecord>(name))
            SwitchStore::Refuse(refusal + "a distributed switch of that name already exists");
        if (numPorts < SwitchLimits::kMinPorts || numPorts > SwitchLimits::kMaxPortsPerSwitch)
            SwitchStore::Refuse(refusal + std::to_string(numPorts) + " is not a valid number of ports (" +
                                std::to_string(SwitchLimits::kMinPorts) + " to " +
                                std::to_string(SwitchLimits::kMaxPortsPerSwitch) + ")");
        const int allocated = SwitchStore::ConfiguredPortsOnHost(t);
        if (allocated + numPorts > SwitchLimits::kMaxPortsPerHost)
            SwitchStore::Refuse(refusal + "its " + std::to_string(numPorts) + " ports and the " +
                                std::to_string(allocated) + " ports already allocated exceed the host's limit of " +
                                std::to_string(SwitchLimits::kMaxPortsPerHost));
        StandardSwitchRecord record;
        record.name = name;
        record.numPorts = numPorts;
        record.policies.teaming = SwitchStore::StorableTeamingPolicy(teaming, "virtual switch " + name);
        record.policies.security = security;
        record.policies.shaping = shaping;
        t.Put(record);
        return record;
    });
    return new VirtualSwitchImpl(std::move(created));
}

std::vector<Gantry::Network::VirtualSwitch*> VirtualSwitchInfoImpl::GetVirtualSwitches() {
    std::vector<StandardSwitchRecord> records =
        kGetVirtualSwitches.Read([](Transaction& t) { return t.List<StandardSwitchRecord>(); });
    std::vector<Gantry::Network::VirtualSwitch*> switches;
    for (StandardSwitchRecord& record : records) switches.push_back(new VirtualSwitchImpl(std::move(record)));
    return switches;
}

Gantry::Network::VirtualSwitch* VirtualSwitchInfoImpl::GetVirtualSwitchByName(std::string const& name) {
    std::optional<StandardSwitchRecord> record =
        kGetVirtualSwitchByName.Read([&](Transaction& t) { return t.Find<StandardSwitchRecord>(name); });
    return record ? new VirtualSwitchImpl(std::move(*record)) : nullptr;
}

void VirtualSwitchInfoImpl::RemoveVirtualSwitch(std::string const& name) {
    kRemoveVirtualSwitch.Write([&](Transaction& t) {
        SwitchStore::RequireSwitch(t, name);
        std::vector<PortGroupRecord> groups = SwitchStore::PortGroupsOf(t, name);
        for (PortGroupRecord const& group : groups)
            if (SwitchStore::ActiveClientsOf(t, group) > 0)
                SwitchStore::Refuse("Unable to remove virtual switch " + name + ": its port group " + group.name +
                                    " has active clients");
        if (SwitchStore::ClientPortsOf(t, name) > 0)
            SwitchStore::Refuse("Unable to remove virtual switch " + name + ": it has ports in use");
        SwitchStore::RemoveUplinkPorts(t, name, std::nullopt);
        for (PortGroupRecord const& group : groups) t.Erase<PortGroupRecord>(group.name);
        t.Erase<StandardSwitchRecord>(name);
    });
}

}  // namespace Network
}  // namespace Trellis

namespace Trellis {
namespace Network {

std::vector<Gantry::Network::DVSwitch*> VirtualSwitchInfoImpl::GetDVSwitches() {
    return kGetDVSwitches.Read([](Transaction& t) { return DVSwitchesOf(t); });
}

std::vector<Gantry::Network::Portset*> VirtualSwitchInfoImpl::GetAllSwitches() {
    // Handles, made from the names alone: callers go through every switch
    // asking its name, and only the switch they are after is read in full.
    return kGetAllSwitches.Read([](Transaction& t) {
        const int numPorts = Gantry::Network::Portset::DEF_NUM_PORTS;
        std::vector<Gantry::Network::Portset*> switches;
        for (const std::string& name : t.Names<StandardSwitchRecord>())
            switches.push_back(new VirtualSwitchImpl(name, numPorts));
        for (const std::string& name : t.Names<Trellis::Host::DVSwitchRecord>())
            switches.push_back(new DVSwitchImpl(name, numPorts));
        return switches;
    });
}

Gantry::Network::DVSwitch* VirtualSwitchInfoImpl::GetDVSwitchByName(std::string const& name) {
    return kGetDVSwitchByName.Read([&](Transaction& t) -> Gantry::Network::DVSwitch* {
        std::optional<Trellis::Host::DVSwitchRecord> record = t.Find<Trellis::Host::DVSwitchRecord>(name);
        if (!record) return nullptr;
        std::vector<std::string> uplinks = DVSwitchStore::UplinksOf(t, name);
        return new DVSwitchImpl(std::move(*record), std::move(uplinks));
    });
}

bool VirtualSwitchInfoImpl::IsLegacySwitch(std::string const& name) {
    return kIsLegacySwitch.Read([&](Transaction& t) { return t.Contains<StandardSwitchRecord>(name); });
}

}  // namespace Network
}  // namespace Trellis
