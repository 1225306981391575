#include "trellis/network/PortGroupImpl.h"

#include <utility>

#include "ConnectionPoints.h"
#include "PolicyInheritance.h"
#include "SwitchStore.h"
#include "trellis/host/Operation.h"
#include "trellis/network/VirtualSwitchImpl.h"

namespace Trellis {
namespace Network {

namespace {

using Trellis::Host::Operation;
using Trellis::Host::PortGroupRecord;
using Trellis::Host::StoredPolicies;
using Trellis::Host::Transaction;

const Operation kGetName("PortGroup::GetName");
const Operation kGetVirtualSwitchName("PortGroup::GetVirtualSwitchName");
const Operation kGetVlanId("PortGroup::GetVlanId");
const Operation kSetVlanId("PortGroup::SetVlanId");
const Operation kGetSecurityPolicy("PortGroup::GetSecurityPolicy");
const Operation kGetLocalSecurityPolicy("PortGroup::GetLocalSecurityPolicy");
const Operation kApplySecurityPolicy("PortGroup::ApplySecurityPolicy");
const Operation kGetTeamingPolicy("PortGroup::GetTeamingPolicy");
const Operation kGetLocalTeamingPolicy("PortGroup::GetLocalTeamingPolicy");
const Operation kApplyTeamingPolicy("PortGroup::ApplyTeamingPolicy");
const Operation kGetShapingPolicy("PortGroup::GetShapingPolicy");
const Operation kGetLocalShapingPolicy("PortGroup::GetLocalShapingPolicy");
const Operation kApplyShapingPolicy("PortGroup::ApplyShapingPolicy");
const Operation kGetVirtualSwitch("PortGroup::GetVirtualSwitch");
const Operation kGetActiveClients("PortGroupImpl::GetActiveClients");
const Operation kConstruct("PortGroupImpl::PortGroupImpl");

// The group's policies in force, read with its switch's at the call.
StoredPolicies InForce(Operation const& operation, PortGroupRecord const& group) {
    return operation.Read([&](Transaction& t) { return SwitchStore::PortGroupPolicies(t, group); });
}

}  // namespace

PortGroupImpl::PortGroupImpl(std::string const& name)
    : snapshot_(kConstruct.Read([&](Transaction& t) { return SwitchStore::RequirePortGroup(t, name); })) {}

PortGroupImpl::PortGroupImpl(PortGroupRecord snapshot) : snapshot_(std::move(snapshot)) {}

int PortGroupImpl::GetType() {
    kConnectionPointGetType.Check();
    return TYPE_PORTGROUP;
}

bool PortGroupImpl::IsValid() {
    return kConnectionPointIsValid.Read([&](Transaction& t) { return t.Contains<PortGroupRecord>(snapshot_.name); });
}

std::string PortGroupImpl::GetPortsetName() {
    kConnectionPointGetPortsetName.Check();
    return snapshot_.vswitch;
}

std::string PortGroupImpl::GetPortGroupName() {
    kConnectionPointGetPortGroupName.Check();
    return snapshot_.name;
}

Gantry::Network::DVPortParam PortGroupImpl::GetDVPortParam() {
    kConnectionPointGetDVPortParam.Check();
    RefusePayload("port group " + snapshot_.name, "DVPort");
}

Gantry::Network::OpaqueNetworkParam PortGroupImpl::GetOpaqueNetworkParam() {
    kConnectionPointGetOpaqueNetworkParam.Check();
    RefusePayload("port group " + snapshot_.name, "opaque network");
}

PortGroupImpl::~PortGroupImpl() {}

std::string PortGroupImpl::GetName() {
    kGetName.Check();
    return snapshot_.name;
}

std::string PortGroupImpl::GetVirtualSwitchName() {
    kGetVirtualSwitchName.Check();
    return snapshot_.vswitch;
}

int PortGroupImpl::GetVlanId() {
    kGetVlanId.Check();
    return snapshot_.vlanId;
}

void PortGroupImpl::SetVlanId(int vlanId) {
    snapshot_ = kSetVlanId.Write([&](Transaction& t) {
        PortGroupRecord record = SwitchStore::RequirePortGroup(t, snapshot_.name);
        if (vlanId < MIN_VLAN_ID || vlanId > MAX_VLAN_ID)
            SwitchStore::Refuse("Invalid VLAN ID " + std::to_string(vlanId) + " for port group " + record.name +
                                ": the VLAN ID must be from " + std::to_string(MIN_VLAN_ID) + " to " +
                                std::to_string(MAX_VLAN_ID));
        record.vlanId = vlanId;
        t.Put(record);
        return record;
    });
}

Gantry::Network::PortSecurityPolicy PortGroupImpl::GetSecurityPolicy() {
    return InForce(kGetSecurityPolicy, snapshot_).security;
}

Gantry::Network::PortSecurityPolicy PortGroupImpl::GetLocalSecurityPolicy() {
    return AsLocal(InForce(kGetLocalSecurityPolicy, snapshot_).security, snapshot_.policies.security);
}

Gantry::Network::NicTeamingPolicy PortGroupImpl::GetTeamingPolicy() {
    return InForce(kGetTeamingPolicy, snapshot_).teaming;
}

Gantry::Network::NicTeamingPolicy PortGroupImpl::GetLocalTeamingPolicy() {
    return AsLocal(InForce(kGetLocalTeamingPolicy, snapshot_).teaming, snapshot_.policies.teaming);
}

Gantry::Network::ShapingPolicy PortGroupImpl::GetShapingPolicy() {
    return InForce(kGetShapingPolicy, snapshot_).shaping;
}

Gantry::Network::ShapingPolicy PortGroupImpl::GetLocalShapingPolicy() {
    return AsLocal(InForce(kGetLocalShapingPolicy, snapshot_).shaping, snapshot_.policies.shaping);
}

namespace {

// Re-reads the group's record, stores one of its policies, and returns what
// was written.
template <class Store>
PortGroupRecord StorePolicy(Operation const& operation, std::string const& name, Store&& store) {
    return operation.Write([&](Transaction& t) {
        PortGroupRecord record = SwitchStore::RequirePortGroup(t, name);
        store(record.policies);
        t.Put(record);
        return record;
    });
}

}  // namespace

void PortGroupImpl::ApplySecurityPolicy(Gantry::Network::PortSecurityPolicy const& policy) {
    snapshot_ = StorePolicy(kApplySecurityPolicy, snapshot_.name,
                            [&](StoredPolicies& policies) { policies.security = policy; });
}

void PortGroupImpl::ApplyTeamingPolicy(Gantry::Network::NicTeamingPolicy const& policy) {
    snapshot_ = StorePolicy(kApplyTeamingPolicy, snapshot_.name, [&](StoredPolicies& policies) {
        policies.teaming = SwitchStore::StorableTeamingPolicy(policy, "port group " + snapshot_.name);
    });
}

void PortGroupImpl::ApplyShapingPolicy(Gantry::Network::ShapingPolicy const& policy) {
    snapshot_ = StorePolicy(kApplyShapingPolicy, snapshot_.name, [&](StoredPolicies& policies) {
        policies.shaping = SwitchStore::StorableShapingPolicy(policy, "port group " + snapshot_.name);
    });
}

Gantry::Network::VirtualSwitch* PortGroupImpl::GetVirtualSwitch() {
    Trellis::Host::StandardSwitchRecord vswitch =
        kGetVirtualSwitch.Read([&](Transaction& t) { return SwitchStore::RequireSwitch(t, snapshot_.vswitch); });
    return new VirtualSwitchImpl(std::move(vswitch));
}

std::int64_t PortGroupImpl::GetActiveClients() {
    return kGetActiveClients.Read([&](Transaction& t) { return SwitchStore::ActiveClientsOf(t, snapshot_); });
}

}  // namespace Network
}  // namespace Trellis
