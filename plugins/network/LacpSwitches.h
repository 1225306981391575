#pragma once

#include <cstddef>
#include <functional>

#include "CommandSupport.h"
#include "gantry/network/DVSwitch.h"
#include "gantry/network/LacpTypes.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The --dvs option of the LACP read commands.
extern const Parameter kLacpSwitchName;

// The distributed switches a LACP read command works on: the one that
// --dvs names (a null pointer when no switch has that name, which the
// commands pass over), or else every distributed switch of the host. When
// the host has none at all, reports "LACP is supported on Korvex DVSwitch
// only, and there is no DVSwitch configured on host." and returns false.
// Host failures are thrown.
bool FindLacpSwitches(Input& input, Output& output, OwnedVector<Gantry::Network::DVSwitch>& switches);

// Hands each running LACP group of the switch to visit, in the host's order,
// then gives the groups back to the switch; returns their number. A host
// failure on the way gives the groups back as well and is thrown on as a
// TrellisException with the same text from the source position given.
std::size_t ForEachLacpGroup(Gantry::Network::DVSwitch& dvSwitch, char const* sourceFile, unsigned int line,
                             std::function<void(Gantry::Network::LacpGroup&)> const& visit);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
