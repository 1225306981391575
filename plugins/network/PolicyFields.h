#pragma once

#include <string>
#include <vector>

#include "CommandSupport.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/ShapingPolicy.h"

namespace KorvexCli {
namespace NetworkNamespace {

// How the policy get commands of switches and port groups show a policy.

// The fields of each policy, declared without values, in the order the get
// commands show them; the port group's override flags after them.
void DeclareFailoverFields(MetaStruct& result);
void DeclareSecurityFields(MetaStruct& result);
void DeclareShapingFields(MetaStruct& result);
void DeclareOverrideFields(MetaStruct& result, std::vector<char const*> const& titles);

// Load Balancing, Network Failure Detection, Notify Switches, Failback and
// the Active, Standby and Unused Adapters, from the policy in force and the
// NICs connected to the switch.
void SetFailoverFields(MetaStruct& result, Gantry::Network::NicTeamingPolicy const& inForce,
                       std::vector<std::string> const& connected);

// Allow Promiscuous, Allow MAC Address Change, Allow Forged Transmits.
void SetSecurityFields(MetaStruct& result, Gantry::Network::PortSecurityPolicy const& inForce);

// Enabled and the three numbers in Kbps and Kib; -1 each for a disabled policy.
void SetShapingFields(MetaStruct& result, Gantry::Network::ShapingPolicy const& inForce);

// The "Override Vswitch ..." fields: the bits set in a port group's own policy.
void SetFailoverOverrides(MetaStruct& result, Gantry::Network::NicTeamingPolicy const& local);
void SetSecurityOverrides(MetaStruct& result, Gantry::Network::PortSecurityPolicy const& local);
void SetShapingOverrides(MetaStruct& result, Gantry::Network::ShapingPolicy const& local);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
