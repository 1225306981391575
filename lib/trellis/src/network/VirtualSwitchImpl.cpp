#include "trellis/network/VirtualSwitchImpl.h"

#include <algorithm>
#include <utility>

#include "PolicyInheritance.h"
#include "SwitchStore.h"
#include "host/StoredText.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/PnicRecord.h"
#include "trellis/network/PortGroupImpl.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::PortGroupRecord;
using Trellis::Host::StandardSwitchRecord;
using Trellis::Host::SwitchLimits;
using Trellis::Host::Transaction;

const Operation kGetPortGroups("VirtualSwitch::GetPortGroups");
const Operation kGetBeaconInterval("VirtualSwitch::GetBeaconInterval");
const Operation kGetBeaconEnabled("VirtualSwitch::GetBeaconEnabled");
const Operation kGetBeaconThreshold("VirtualSwitch::GetBeaconThreshold");
const Operation kGetBeaconRequiredBy("VirtualSwitch::GetBeaconRequiredBy");
const Operation kSetCdpStatus("VirtualSwitch::SetCdpStatus");
const Operation kGetCdpStatus("VirtualSwitch::GetCdpStatus");
const Operation kGetMtu("VirtualSwitch::GetMtu");
const Operation kSetMtu("VirtualSwitch::SetMtu");
const Operation kAddUplink("VirtualSwitch::AddUplink");
const Operation kRemoveUplink("VirtualSwitch::RemoveUplink");
const Operation kAddPortGroup("VirtualSwitch::AddPortGroup");
const Operation kRemovePortGroup("VirtualSwitch::RemovePortGroup");
const Operation kGetSecurityPolicy("VirtualSwitch::GetSecurityPolicy");
const Operation kApplySecurityPolicy("VirtualSwitch::ApplySecurityPolicy");
const Operation kGetShapingPolicy("VirtualSwitch::GetShapingPolicy");
const Operation kApplyShapingPolicy("VirtualSwitch::ApplyShapingPolicy");
const Operation kGetTeamingPolicy("VirtualSwitch::GetTeamingPolicy");
const Operation kGetLocalTeamingPolicy("VirtualSwitch::GetLocalTeamingPolicy");
const Operation kApplyTeamingPolicy("VirtualSwitch::ApplyTeamingPolicy");

bool Contains(std::vector<std::string> const& names, std::string const& name) {
    return std::find(names.begin(), names.end(), name) != names.end();
}

}  // namespace

VirtualSwitchImpl::VirtualSwitchImpl(StandardSwitchRecord snapshot)
    : PortsetImpl(snapshot.name, snapshot.numPorts, snapshot.uplinks, CLASS_NAME), snapshot_(std::move(snapshot)) {}

VirtualSwitchImpl::VirtualSwitchImpl(std::string const& name, int numPorts) : PortsetImpl(name, numPorts, CLASS_NAME) {
    snapshot_.name = name;
}

VirtualSwitchImpl::~VirtualSwitchImpl() {}

void VirtualSwitchImpl::Load(Transaction const& t) { Refresh(SwitchStore::RequireSwitch(t, name_)); }

template <class Change>
void VirtualSwitchImpl::Update(Operation const& operation, Change&& change) {
    StandardSwitchRecord written = operation.Write([&](Transaction& t) {
        StandardSwitchRecord record = SwitchStore::RequireSwitch(t, name_);
        change(t, record);
        t.Put(record);
        return record;
    });
    Refresh(written);
}

void VirtualSwitchImpl::Refresh(StandardSwitchRecord const& record) {
    snapshot_ = record;
    numPorts_ = record.numPorts;
    uplinks_ = record.uplinks;
}

std::vector<Gantry::Network::PortGroup*> VirtualSwitchImpl::GetPortGroups() {
    std::vector<PortGroupRecord> records =
        kGetPortGroups.Read([&](Transaction& t) { return SwitchStore::PortGroupsOf(t, name_); });
    std::vector<Gantry::Network::PortGroup*> groups;
    for (PortGroupRecord& record : records) groups.push_back(new PortGroupImpl(std::move(record)));
    return groups;
}

int VirtualSwitchImpl::GetBeaconInterval() {
    Answer(kGetBeaconInterval);
    return snapshot_.beaconInterval;
}

bool VirtualSwitchImpl::GetBeaconEnabled() {
    Answer(kGetBeaconEnabled);
    return snapshot_.beaconEnabled;
}

int VirtualSwitchImpl::GetBeaconThreshold() {
    Answer(kGetBeaconThreshold);
    return snapshot_.beaconThreshold;
}

std::vector<std::string> VirtualSwitchImpl::GetBeaconRequiredBy() {
    return kGetBeaconRequiredBy.Read([&](Transaction& t) {
        EnsureLoaded(t);
        Trellis::Host::StoredPolicies switchInForce = SwitchPoliciesInForce(snapshot_);
        std::vector<std::string> names;
        if (switchInForce.teaming.linkCriteria.IsBeaconDetection()) names.push_back(name_);
        for (PortGroupRecord const& group : SwitchStore::PortGroupsOf(t, name_))
            if (PortGroupPoliciesInForce(switchInForce, group).teaming.linkCriteria.IsBeaconDetection())
                names.push_back(group.name);
        return names;
    });
}

void VirtualSwitchImpl::SetCdpStatus(Gantry::Network::CdpStatus status) {
    auto value = static_cast<int>(status);
    Update(kSetCdpStatus, [&](Transaction&, StandardSwitchRecord& record) {
        if (value < 0 || value > 3)
            SwitchStore::Refuse("Invalid CDP status " + std::to_string(value) + " for virtual switch " + name_);
        record.cdpStatus = status;
    });
}

std::string VirtualSwitchImpl::GetCdpStatus() {
    Answer(kGetCdpStatus);
    return Trellis::Host::WordOf(snapshot_.cdpStatus, Trellis::Host::kCdpStatusWords);
}

int VirtualSwitchImpl::GetMtu() {
    Answer(kGetMtu);
    return snapshot_.mtu;
}

void VirtualSwitchImpl::SetMtu(int mtu) {
    Update(kSetMtu, [&](Transaction&, StandardSwitchRecord& record) {
        if (mtu < SwitchLimits::kMinMtu || mtu > SwitchLimits::kMaxMtu)
            SwitchStore::Refuse("Invalid MTU " + std::to_string(mtu) + " for virtual switch " + name_ +
                                ": the MTU must be from " + std::to_string(SwitchLimits::kMinMtu) + " to " +
                                std::to_string(SwitchLimits::kMaxMtu));
        record.mtu = mtu;
    });
}

void VirtualSwitchImpl::AddUplink(std::string const& nicName) {
    Update(kAddUplink, [&](Transaction& t, StandardSwitchRecord& record) {
        const std::string refusal =
            "Unable to add uplink " + Trellis::Host::Printable(nicName) + " to virtual switch " + name_ + ": ";
        if (!t.Contains<Trellis::Host::PnicRecord>(nicName))
            SwitchStore::Refuse(refusal + "there is no physical NIC of that name");
        if (Contains(record.uplinks, nicName)) SwitchStore::Refuse(refusal + "it is already an uplink of this switch");
        if (std::optional<std::string> other = SwitchStore::SwitchOfUplink(t, nicName))
            SwitchStore::Refuse(refusal + "it is already an uplink of " + *other);
        if (SwitchStore::UsedPortsOf(t, record) >= record.numPorts)
            SwitchStore::Refuse(refusal + "all " + std::to_string(record.numPorts) + " ports of the switch are in use");
        record.uplinks.push_back(nicName);
        SwitchStore::AddUplinkPort(t, name_, nicName);
    });
}

void VirtualSwitchImpl::RemoveUplink(std::string const& nicName) {
    Update(kRemoveUplink, [&](Transaction& t, StandardSwitchRecord& record) {
        auto position = std::find(record.uplinks.begin(), record.uplinks.end(), nicName);
        if (position == record.uplinks.end())
            SwitchStore::Refuse("Unable to remove uplink " + nicName + " from virtual switch " + name_ +
                                ": it is not an uplink of this switch");
        record.uplinks.erase(position);
        SwitchStore::RemoveUplinkPorts(t, name_, nicName);
    });
}

Gantry::Network::PortGroup* VirtualSwitchImpl::AddPortGroup(std::string const& portGroupName) {
    PortGroupRecord created = kAddPortGroup.Write([&](Transaction& t) {
        SwitchStore::RequireSwitch(t, name_);
        const std::string refusal = "Unable to add port group " + Trellis::Host::Printable(portGroupName) +
                                    " to virtual switch " + name_ + ": ";
        if (portGroupName.empty()) SwitchStore::Refuse(refusal + "a port group name must not be empty");
        SwitchStore::RequireStorableName(portGroupName, refusal);
        if (std::optional<PortGroupRecord> taken = t.Find<PortGroupRecord>(portGroupName))
            SwitchStore::Refuse(refusal + "a port group of that name already exists on virtual switch " +
                                taken->vswitch);
        PortGroupRecord record;
        record.name = portGroupName;
        record.vswitch = name_;
        t.Put(record);
        return record;
    });
    return new PortGroupImpl(std::move(created));
}

void VirtualSwitchImpl::RemovePortGroup(std::string const& portGroupName) {
    kRemovePortGroup.Write([&](Transaction& t) {
        SwitchStore::RequireSwitch(t, name_);
        const std::string refusal =
            "Unable to remove port group " + portGroupName + " from virtual switch " + name_ + ": ";
        std::optional<PortGroupRecord> group = t.Find<PortGroupRecord>(portGroupName);
        if (!group || group->vswitch != name_) SwitchStore::Refuse(refusal + "the switch has no port group of that name");
        if (std::int64_t clients = SwitchStore::ActiveClientsOf(t, *group))
            SwitchStore::Refuse(refusal + "it has " + std::to_string(clients) + " active client" +
                                (clients == 1 ? "" : "s"));
        t.Erase<PortGroupRecord>(portGroupName);
    });
}

Gantry::Network::PortSecurityPolicy VirtualSwitchImpl::GetSecurityPolicy() {
    Answer(kGetSecurityPolicy);
    return SwitchPoliciesInForce(snapshot_).security;
}

void VirtualSwitchImpl::ApplySecurityPolicy(Gantry::Network::PortSecurityPolicy const& policy) {
    Update(kApplySecurityPolicy, [&](Transaction&, StandardSwitchRecord& record) { record.policies.security = policy; });
}

Gantry::Network::ShapingPolicy VirtualSwitchImpl::GetShapingPolicy() {
    Answer(kGetShapingPolicy);
    return SwitchPoliciesInForce(snapshot_).shaping;
}

void VirtualSwitchImpl::ApplyShapingPolicy(Gantry::Network::ShapingPolicy const& policy) {
    Update(kApplyShapingPolicy, [&](Transaction&, StandardSwitchRecord& record) {
        record.policies.shaping = SwitchStore::StorableShapingPolicy(policy, "virtual switch " + name_);
    });
}

Gantry::Network::NicTeamingPolicy VirtualSwitchImpl::GetTeamingPolicy() {
    Answer(kGetTeamingPolicy);
    return SwitchPoliciesInForce(snapshot_).teaming;
}

Gantry::Network::NicTeamingPolicy VirtualSwitchImpl::GetLocalTeamingPolicy() {
    Answer(kGetLocalTeamingPolicy);
    return AsLocal(SwitchPoliciesInForce(snapshot_).teaming, snapshot_.policies.teaming);
}

void VirtualSwitchImpl::ApplyTeamingPolicy(Gantry::Network::NicTeamingPolicy const& policy) {
    Update(kApplyTeamingPolicy, [&](Transaction&, StandardSwitchRecord& record) {
        record.policies.teaming = SwitchStore::StorableTeamingPolicy(policy, "virtual switch " + name_);
    });
}

}  // namespace Network
}  // namespace Trellis
