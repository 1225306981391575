#include "PolicyInheritance.h"

namespace Trellis {
namespace Network {

namespace {

using Gantry::Network::NicTeamingPolicy;
using Gantry::Network::PortSecurityPolicy;
using Gantry::Network::ShapingPolicy;

template <class Field>
void TakeIfSet(std::uint32_t mask, std::uint32_t bit, Field& into, Field const& from) {
    if ((mask & bit) != 0) into = from;
}

template <class Policy>
Policy HostDefault() {
    Policy policy = Policy::GetDefaultPolicy();
    policy.UnsetAll();
    return policy;
}

}  // namespace

NicTeamingPolicy Inherit(NicTeamingPolicy const& parent, NicTeamingPolicy const& local) {
    NicTeamingPolicy result = parent;
    const std::uint32_t mask = local.setMask;
    TakeIfSet(mask, NicTeamingPolicy::MASK_TEAM_POLICY, result.teamPolicy, local.teamPolicy);
    TakeIfSet(mask, NicTeamingPolicy::MASK_RESERVED0, result.reserved0, local.reserved0);
    TakeIfSet(mask, NicTeamingPolicy::MASK_NOTIFY_SWITCH, result.notifySwitchOnFailure, local.notifySwitchOnFailure);
    TakeIfSet(mask, NicTeamingPolicy::MASK_LINK_CRITERIA, result.linkCriteria, local.linkCriteria);
    TakeIfSet(mask, NicTeamingPolicy::MASK_UPLINK_ORDER, result.uplinkOrder, local.uplinkOrder);
    TakeIfSet(mask, NicTeamingPolicy::MASK_ROLLING_RESTORATION, result.rollingRestoration, local.rollingRestoration);
    TakeIfSet(mask, NicTeamingPolicy::MASK_MAX_ACTIVE_UPLINKS, result.maxActiveUplinks, local.maxActiveUplinks);
    result.setMask = parent.setMask | mask;
    return result;
}

PortSecurityPolicy Inherit(PortSecurityPolicy const& parent, PortSecurityPolicy const& local) {
    PortSecurityPolicy result = parent;
    const std::uint32_t mask = local.setMask;
    TakeIfSet(mask, PortSecurityPolicy::MASK_PROMISCUOUS, result.allowPromiscuous, local.allowPromiscuous);
    TakeIfSet(mask, PortSecurityPolicy::MASK_MAC_ADDRESS_CHANGE, result.allowMacAddressChange,
              local.allowMacAddressChange);
    TakeIfSet(mask, PortSecurityPolicy::MASK_FORGED_TRANSMITS, result.allowForgedTransmits, local.allowForgedTransmits);
    result.setMask = parent.setMask | mask;
    return result;
}

ShapingPolicy Inherit(ShapingPolicy const& parent, ShapingPolicy const& local) {
    ShapingPolicy result = parent;
    const std::uint32_t mask = local.setMask;
    TakeIfSet(mask, ShapingPolicy::MASK_ENABLED, result.enabled, local.enabled);
    TakeIfSet(mask, ShapingPolicy::MASK_AVERAGE_BPS, result.averageBps, local.averageBps);
    TakeIfSet(mask, ShapingPolicy::MASK_PEAK_BPS, result.peakBps, local.peakBps);
    TakeIfSet(mask, ShapingPolicy::MASK_BURST_SIZE, result.burstSize, local.burstSize);
    result.setMask = parent.setMask | mask;
    return result;
}

Trellis::Host::StoredPolicies SwitchPoliciesInForce(Trellis::Host::StandardSwitchRecord const& vswitch) {
    Trellis::Host::StoredPolicies inForce;
    inForce.teaming = Inherit(HostDefault<NicTeamingPolicy>(), vswitch.policies.teaming);
    inForce.security = Inherit(HostDefault<PortSecurityPolicy>(), vswitch.policies.security);
    inForce.shaping = Inherit(HostDefault<ShapingPolicy>(), vswitch.policies.shaping);
    return inForce;
}

Trellis::Host::StoredPolicies PortGroupPoliciesInForce(Trellis::Host::StoredPolicies const& switchInForce,
                                                       Trellis::Host::PortGroupRecord const& group) {
    Trellis::Host::StoredPolicies inForce;
    inForce.teaming = Inherit(switchInForce.teaming, group.policies.teaming);
    inForce.security = Inherit(switchInForce.security, group.policies.security);
    inForce.shaping = Inherit(switchInForce.shaping, group.policies.shaping);
    return inForce;
}

}  // namespace Network
}  // namespace Trellis
