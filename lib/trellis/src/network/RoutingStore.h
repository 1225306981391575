#pragma once

// Reading a netstack's routing inside one host operation's transaction: the
// subnets of its interfaces, and through them the interface of a gateway.
// IPv6 networks are compared, like IPv4 ones, without their host bits.

#include <string>
#include <vector>

#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv4Network.h"
#include "gantry/network/Ipv6Address.h"
#include "gantry/network/Ipv6Network.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/TslNicRecord.h"

namespace Trellis {
namespace Network {
namespace RoutingStore {

Trellis::Host::NetstackRecord RequireNetstack(Trellis::Host::Transaction const& t, std::string const& key);

struct Ipv4Subnet {
    std::string interfaceName;
    Gantry::Network::Ipv4Network network;
};
struct Ipv6Subnet {
    std::string interfaceName;
    Gantry::Network::Ipv6Network network;  // host bits cleared
};

// The subnets of the netstack's interfaces in force, by interface name.
std::vector<Ipv4Subnet> Ipv4Subnets(Trellis::Host::Transaction const& t, std::string const& key);
std::vector<Ipv6Subnet> Ipv6Subnets(Trellis::Host::Transaction const& t, std::string const& key);

// The interface whose subnet holds the address; "" for none.
std::string InterfaceOf(std::vector<Ipv4Subnet> const& subnets, Gantry::Network::Ipv4Address const& address);
std::string InterfaceOf(std::vector<Ipv6Subnet> const& subnets, Gantry::Network::Ipv6Address const& address);

// The network without its host bits.
Gantry::Network::Ipv6Network Masked(Gantry::Network::Ipv6Network const& network);

// Takes out of the netstack's routing what went through the interface: its
// neighbour entries, the routes and default gateways whose gateway only it
// reached. Called as the interface is removed, with the interface already gone.
void DropInterface(Trellis::Host::Transaction& t, Trellis::Host::TslNicRecord const& nic,
                   std::vector<Ipv4Subnet> const& ipv4Before, std::vector<Ipv6Subnet> const& ipv6Before);

}  // namespace RoutingStore
}  // namespace Network
}  // namespace Trellis
