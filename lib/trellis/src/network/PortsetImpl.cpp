#include "trellis/network/PortsetImpl.h"

#include <optional>
#include <set>
#include <utility>

#include "SwitchStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/host/Operation.h"
#include "trellis/network/PortImpl.h"

namespace Trellis {
namespace Network {

namespace {
const Trellis::Host::Operation kGetName("Portset::GetName");
const Trellis::Host::Operation kGetNumPorts("Portset::GetNumPorts");
const Trellis::Host::Operation kGetConfiguredPorts("Portset::GetConfiguredPorts");
const Trellis::Host::Operation kGetUsedPorts("Portset::GetUsedPorts");
const Trellis::Host::Operation kGetUplinks("Portset::GetUplinks");
const Trellis::Host::Operation kGetClass("Portset::GetClass");
const Trellis::Host::Operation kIsValidVirtualSwitch("PortsetImpl::IsValidVirtualSwitch");
const Trellis::Host::Operation kGetPorts("PortsetImpl::GetPorts");
const Trellis::Host::Operation kGetUplinkVlanStats("PortsetImpl::GetUplinkVlanStats");
const Trellis::Host::Operation kSetUplinkVlanStatsEnabled("PortsetImpl::SetUplinkVlanStatsEnabled");

// The port of the NIC's uplink on the switch.
Trellis::Host::PortRecord RequireUplinkPort(Trellis::Host::Transaction const& t, std::string const& vswitch,
                                            std::string const& nicName) {
    std::optional<Trellis::Host::PortRecord> port = SwitchStore::UplinkPortOf(t, vswitch, nicName);
    if (port) return std::move(*port);
    throw Gantry::Lib::GantryException("Physical NIC " + Trellis::Host::Printable(nicName) + " is no uplink of switch " +
                                       Trellis::Host::Printable(vswitch));
}

// The VLANs a switch carries: those of its port groups (a distributed
// switch has none of its own here), in ascending order, each once.
std::set<int> VlansOfSwitch(Trellis::Host::Transaction const& t, std::string const& vswitch) {
    std::set<int> vlans;
    for (Trellis::Host::PortGroupRecord const& group : t.ChildrenOf<Trellis::Host::PortGroupRecord>(vswitch))
        vlans.insert(group.vlanId);
    return vlans;
}
}  // namespace

PortsetImpl::PortsetImpl(std::string name, int numPorts, std::vector<std::string> uplinks, std::string className)
    : name_(std::move(name)),
      numPorts_(numPorts),
      uplinks_(std::move(uplinks)),
      className_(std::move(className)),
      loaded_(true) {}

PortsetImpl::PortsetImpl(std::string name, int numPorts, std::string className)
    : name_(std::move(name)), numPorts_(numPorts), className_(std::move(className)), loaded_(false) {}

void PortsetImpl::Answer(Trellis::Host::Operation const& operation) {
    if (loaded_)
        operation.Check();
    else
        operation.Read([&](Trellis::Host::Transaction& t) { EnsureLoaded(t); });
}

void PortsetImpl::EnsureLoaded(Trellis::Host::Transaction const& t) {
    if (loaded_) return;
    Load(t);
    loaded_ = true;
}

PortsetImpl::~PortsetImpl() {}

// A handle knows its name without asking the host.
std::string PortsetImpl::GetName() {
    kGetName.Check();
    return name_;
}

// The simulated host reserves no ports of its own: a switch has the ports it
// was configured with.
int PortsetImpl::GetNumPorts() {
    Answer(kGetNumPorts);
    return numPorts_;
}

int PortsetImpl::GetConfiguredPorts() {
    Answer(kGetConfiguredPorts);
    return numPorts_;
}

int PortsetImpl::GetUsedPorts() {
    return kGetUsedPorts.Read([&](Trellis::Host::Transaction& t) {
        EnsureLoaded(t);
        return static_cast<int>(SwitchStore::ClientPortsOf(t, name_)) + static_cast<int>(uplinks_.size());
    });
}

std::vector<std::string> PortsetImpl::GetUplinks() {
    Answer(kGetUplinks);
    return uplinks_;
}

std::string PortsetImpl::GetClass() {
    Answer(kGetClass);
    return className_;
}

std::vector<PortImpl*> PortsetImpl::GetPorts() {
    std::vector<Trellis::Host::PortRecord> records = kGetPorts.Read([&](Trellis::Host::Transaction& t) {
        EnsureLoaded(t);
        return t.ChildrenOf<Trellis::Host::PortRecord>(name_);
    });
    std::vector<PortImpl*> ports;
    for (Trellis::Host::PortRecord& record : records) ports.push_back(new PortImpl(std::move(record)));
    return ports;
}

std::vector<Gantry::Network::VlanStats*> PortsetImpl::GetUplinkVlanStats(std::string nicName) {
    Trellis::Host::PortRecord port = kGetUplinkVlanStats.Read([&](Trellis::Host::Transaction& t) {
        EnsureLoaded(t);
        return RequireUplinkPort(t, name_, nicName);
    });
    std::vector<Gantry::Network::VlanStats*> stats;
    if (!port.vlanStats) return stats;
    for (Trellis::Host::VlanCounterRecord const& vlan : *port.vlanStats)
        stats.push_back(new Gantry::Network::VlanStats{vlan.vlanId, vlan.rxPackets, vlan.txPackets});
    return stats;
}

void PortsetImpl::SetUplinkVlanStatsEnabled(std::string nicName, bool enabled) {
    kSetUplinkVlanStatsEnabled.Write([&](Trellis::Host::Transaction& t) {
        EnsureLoaded(t);
        Trellis::Host::PortRecord port = RequireUplinkPort(t, name_, nicName);
        if (!enabled) {
            port.vlanStats.reset();
        } else if (!port.vlanStats) {
            port.vlanStats.emplace();
            for (int vlan : VlansOfSwitch(t, name_)) port.vlanStats->push_back(Trellis::Host::VlanCounterRecord{vlan, 0, 0});
        }
        t.Put(port);
    });
}

bool PortsetImpl::IsValidVirtualSwitch(std::string const& name) {
    return kIsValidVirtualSwitch.Read(
        [&](Trellis::Host::Transaction& t) { return t.Contains<Trellis::Host::StandardSwitchRecord>(name); });
}

}  // namespace Network
}  // namespace Trellis
