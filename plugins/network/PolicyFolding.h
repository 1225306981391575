#pragma once

#include <boost/shared_ptr.hpp>
#include <string>
#include <vector>

#include "CommandSupport.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/ShapingPolicy.h"

namespace KorvexCli {
namespace NetworkNamespace {

// Fold the parameters of PolicyParameters.h into a policy value. They change
// only the objects they are handed and report every refused value through
// output->SetError, going on with the rest; the caller tests HasError and
// stores nothing then. Storing is the caller's job.

// Folds the failover parameters into policy, the object to be stored.
// reference is the policy in force: its uplink order and active count say
// which names are active and standby now. connected names the NICs connected
// to the switch; a listed uplink must be a known NIC and one of these. When
// only one of the two lists is given, the other part of the present order
// survives. The uplink order keeps the order the user typed.
// IsValidPnic reads the host; an exception from it passes out.
void SetFailoverPolicy(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output,
                       Gantry::Network::NicTeamingPolicy& policy, Gantry::Network::NicTeamingPolicy& reference,
                       std::vector<std::string> const& connected);

// Sets each security option that was given. Reports nothing.
void SetSecurityPolicy(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output,
                       Gantry::Network::PortSecurityPolicy& policy);

// Sets enabled if given; on a policy that is then enabled, stores the given
// bandwidths (Kbps, times 1000) and burst size (Kib, times 128). A missing
// value is reported when requireAll is true or this call itself enabled
// shaping; on a disabled policy the values are dropped without a word.
void SetShapingPolicy(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output,
                      Gantry::Network::ShapingPolicy& policy, bool requireAll);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
