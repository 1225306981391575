#pragma once

#include <string>

#include "gantry/network/IpAddress.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The word by which the route commands of both families name the default
// network, in their options and in their lists.
extern const char* const kDefaultNetworkWord;

// The network a route option names: the default network for exactly
// "default", else the network of the text, whose constructor throws
// GantryException on a malformed one.
template <class Network>
Network RouteNetwork(std::string const& text, Network const& defaultNetwork) {
    return text == kDefaultNetworkWord ? defaultNetwork : Network(text);
}

// What removing the default route reports for a gateway that is neither the
// default gateway in force nor the configured one.
std::string NotADefaultRoute(Gantry::Network::IpAddress const& gateway);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
