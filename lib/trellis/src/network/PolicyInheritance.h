#pragma once

// How the host resolves the policies in force. A stored policy keeps only
// the settings whose bits are set in its setMask. A switch's policy in force
// takes each unset setting from the host's default (GetDefaultPolicy); a port
// group's takes each unset setting from its switch's policy in force. So a
// stored policy with an empty mask follows its parent in every setting.
//
// The setMask of a policy in force tells which settings are configured
// somewhere on the way down (at the switch or at the group); a setting that
// only the host's default supplies has its bit clear.

#include "trellis/host/records/SwitchRecords.h"

namespace Trellis {
namespace Network {

// local's set settings over parent's values; the mask is the union.
Gantry::Network::NicTeamingPolicy Inherit(Gantry::Network::NicTeamingPolicy const& parent,
                                          Gantry::Network::NicTeamingPolicy const& local);
Gantry::Network::PortSecurityPolicy Inherit(Gantry::Network::PortSecurityPolicy const& parent,
                                            Gantry::Network::PortSecurityPolicy const& local);
Gantry::Network::ShapingPolicy Inherit(Gantry::Network::ShapingPolicy const& parent,
                                       Gantry::Network::ShapingPolicy const& local);

Trellis::Host::StoredPolicies SwitchPoliciesInForce(Trellis::Host::StandardSwitchRecord const& vswitch);
Trellis::Host::StoredPolicies PortGroupPoliciesInForce(Trellis::Host::StoredPolicies const& switchInForce,
                                                       Trellis::Host::PortGroupRecord const& group);

// The local view of a stored policy: the values in force, with the stored
// mask, so that a caller that changes some settings and stores the policy
// again sets only what it changed.
template <class Policy>
Policy AsLocal(Policy inForce, Policy const& stored) {
    inForce.setMask = stored.setMask;
    return inForce;
}

}  // namespace Network
}  // namespace Trellis
