#pragma once

#include <string>
#include <vector>

#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The names of the host's physical NICs, in the host's order.
std::vector<std::string> PnicNames(Trellis::Network::NetworkInfoImpl& networkInfo);

// A switch's uplinks without those that the host does not own as a physical
// NIC; the order of the rest stands. The switch lists show only these.
std::vector<std::string> KnownUplinks(std::vector<std::string> uplinks, std::vector<std::string> const& pnicNames);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
