#pragma once

#include <string>
#include <vector>

#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv4Network.h"
#include "gantry/network/Ipv6Address.h"
#include "gantry/network/Ipv6Network.h"
#include "gantry/network/Routes.h"

namespace Trellis {
namespace Network {

// The routes, default gateways and neighbour tables of one netstack instance.
// A stack object; its constructor and SetNetstackInstanceKey only choose the
// instance, and each operation reads or changes it on the host (an unknown
// instance is refused there).
class RoutingInfoImpl {
public:
    // The default networks: 0.0.0.0/0 and ::/0.
    static const Gantry::Network::Ipv4Network DEFAULT_IPV4_ROUTE;
    static const Gantry::Network::Ipv6Network DEFAULT_IPV6_ROUTE;

    explicit RoutingInfoImpl(std::string const& netstackKey);
    ~RoutingInfoImpl();

    void SetNetstackInstanceKey(std::string const& netstackKey);

    // A route goes through the interface whose subnet holds the gateway; the
    // default network sets the default gateway. Refuses a gateway that is
    // unspecified, multicast, or on no subnet of the netstack's interfaces,
    // and a route the netstack has already.
    void AddTesselRoute(Gantry::Network::Ipv4Network network, Gantry::Network::Ipv4Address gateway);
    // Refuses a route the netstack does not have.
    void RemoveTesselRoute(Gantry::Network::Ipv4Network network, Gantry::Network::Ipv4Address gateway);
    void AddIpv6TesselRoute(Gantry::Network::Ipv6Network network, Gantry::Network::Ipv6Address gateway);
    void RemoveIpv6TesselRoute(Gantry::Network::Ipv6Network network, Gantry::Network::Ipv6Address gateway);

    // The routes in force: each interface's own subnet, then the routes, then
    // the default route while there is a default gateway.
    std::vector<Gantry::Network::Ipv4Route> GetCurrentTesselRoutes();
    std::vector<Gantry::Network::Ipv6Route> GetCurrentIpv6TesselRoutes();
    // "DHCP" for the default route of a gateway offered by DHCP, "MANUAL" for
    // any other route.
    std::string GetDefaultGatewaySource(Gantry::Network::Ipv4Network network);

    Gantry::Network::Ipv4Address GetTesselDefaultGateway();
    Gantry::Network::Ipv4Address GetTesselConfigDefaultGateway();
    Gantry::Network::Ipv6Address GetIpv6TesselDefaultGateway();
    Gantry::Network::Ipv6Address GetIpv6TesselConfigDefaultGateway();
    // 0.0.0.0 (or ::) clears the default gateway. The simulated host has no
    // use for the flag.
    void SetTesselDefaultGateway(Gantry::Network::Ipv4Address gateway, bool flag);
    void SetIpv6TesselDefaultGateway(Gantry::Network::Ipv6Address gateway);

    // The entries of the neighbour tables, of one interface or (an empty
    // name) of all.
    void GetCurrentIpv4TesselNeighbors(std::vector<Gantry::Network::Ipv4Neighbor>& neighbors,
                                       std::string const& interfaceName);
    void GetCurrentIpv6TesselNeighbors(std::vector<Gantry::Network::Ipv6Neighbor>& neighbors,
                                       std::string const& interfaceName);
    // "Local", "Dynamic" or "Static" (IPv4); "Router", "Host" (IPv6); the
    // state: "Reachable", "Stale", "Delay", "Probe", "Incomplete".
    std::string GetIpv4NeighborType(Gantry::Network::Ipv4Neighbor neighbor);
    std::string GetIpv6NeighborType(Gantry::Network::Ipv6Neighbor neighbor);
    std::string GetIpv6NeighborState(Gantry::Network::Ipv6Neighbor neighbor);
    // Deletes the entry of that address on the interface (an empty name: on
    // every interface); refuses when there is none.
    void RemoveIpv4Neighbor(Gantry::Network::Ipv4Neighbor neighbor);
    void RemoveIpv6Neighbor(Gantry::Network::Ipv6Neighbor neighbor);

private:
    std::string netstackKey_;
};

}  // namespace Network
}  // namespace Trellis
