#pragma once

// The plain values of a netstack's routing: routes and neighbour table
// entries, as the host hands them out.

#include <string>

#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv4Network.h"
#include "gantry/network/Ipv6Address.h"
#include "gantry/network/Ipv6Network.h"

namespace Gantry {
namespace Network {

struct Ipv4Route {
    Ipv4Network network;
    Ipv4Address gateway;
    std::string interfaceName;
};

struct Ipv6Route {
    Ipv6Network network;
    Ipv6Address gateway;
    std::string interfaceName;
};

struct Ipv4Neighbor {
    Ipv4Address address;
    std::string macAddress;
    std::string interfaceName;
    int expiry = 0;  // seconds
};

struct Ipv6Neighbor {
    Ipv6Address address;
    std::string macAddress;
    std::string interfaceName;
    int expiry = 0;  // seconds
};

}  // namespace Network
}  // namespace Gantry
