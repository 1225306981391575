#pragma once

#include <vector>

#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv4Network.h"
#include "gantry/network/Ipv6Address.h"
#include "gantry/network/Ipv6Network.h"

namespace Gantry {
namespace System {

// The sources a ruleset admits when it does not admit all: four lists of
// value objects, each element printing itself with GetStringAddress. A
// network is held with its host bits cleared ("198.51.100.0/24").
struct FirewallAllowedIpList {
    std::vector<Network::Ipv4Address> ipv4Addresses;
    std::vector<Network::Ipv4Network> ipv4Networks;
    std::vector<Network::Ipv6Address> ipv6Addresses;
    std::vector<Network::Ipv6Network> ipv6Networks;
};

}  // namespace System
}  // namespace Gantry
