// The host side of netstack instances and their routing: instances added,
// taken into the kernel and removed; routes through the interface whose
// subnet holds their gateway; default gateways in force and configured;
// neighbour tables; and what removing an interface takes with it.

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "SwitchTestSupport.h"
#include "TempHost.h"
#include "trellis/network/NetstackInstanceImpl.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/RoutingInfoImpl.h"
#include "trellis/network/TesselNicInfoImpl.h"

using namespace SwitchTest;
using Gantry::Network::Ipv4Address;
using Gantry::Network::Ipv4Network;
using Gantry::Network::Ipv6Address;
using Gantry::Network::Ipv6Network;
using Trellis::Network::RoutingInfoImpl;
using Names = std::vector<std::string>;

namespace {

Names Ipv4Routes(RoutingInfoImpl& routing) {
    Names routes;
    for (const auto& route : routing.GetCurrentTesselRoutes())
        routes.push_back(route.network.GetStringAddress() + " via " + route.gateway.GetStringAddress() + " on " +
                         route.interfaceName);
    return routes;
}

Names Ipv6Routes(RoutingInfoImpl& routing) {
    Names routes;
    for (const auto& route : routing.GetCurrentIpv6TesselRoutes())
        routes.push_back(route.network.GetStringAddress() + " via " + route.gateway.GetStringAddress() + " on " +
                         route.interfaceName);
    return routes;
}

std::unique_ptr<Gantry::Network::NetstackInstance> Netstack(const std::string& key) {
    return std::unique_ptr<Gantry::Network::NetstackInstance>(
        Trellis::Network::NetworkInfoImpl().LookupNetstackInstanceByKey(key));
}

}  // namespace

TEST(RoutingHost, ANetstackTakesItsValuesIntoForceWhenItIsCreatedInTheKernel) {
    TempHost host;
    Trellis::Network::NetworkInfoImpl info;
    Trellis::Network::NetstackInstanceImpl made("vmotionStack", 11000, "newreno", true, 2);
    info.AddNetstackInstance(&made, true);
    auto stack = Netstack("vmotionStack");
    EXPECT_EQ(stack->GetState(), 0);
    stack->SetMaxConnections(5000, true);
    stack->SetIpv6Enabled(false, true);
    stack->SetCongestionControlAlgorithm("cubic", true);
    EXPECT_EQ(stack->GetCurrentMaxConnections(), 11000);
    EXPECT_TRUE(stack->GetCurrentIpv6Enabled());
    stack->Enable();
    EXPECT_EQ(stack->GetState(), 4660);
    EXPECT_EQ(stack->GetCurrentMaxConnections(), 5000);
    EXPECT_FALSE(stack->GetCurrentIpv6Enabled());
    EXPECT_EQ(Netstack("vmotionStack")->GetCongestionControlAlgorithm(), "cubic");

    EXPECT_EQ(FailureOf([&] { stack->SetCongestionControlAlgorithm("bbr", true); }),
              "Invalid congestion control algorithm bbr for netstack instance vmotionStack: the host offers newreno and "
              "cubic");
    EXPECT_EQ(FailureOf([&] { info.AddNetstackInstance(&made, false); }),
              "Unable to add netstack instance vmotionStack: an instance of that key exists already");
    Trellis::Network::NetstackInstanceImpl unnamed("", 11000, "newreno", true, 2);
    EXPECT_EQ(FailureOf([&] { info.AddNetstackInstance(&unnamed, false); }),
              "Unable to add a netstack instance: its key must not be empty");
    EXPECT_EQ(FailureOf([&] { info.RemoveNetstackInstance("defaultTcpipStack", false); }),
              "Unable to remove netstack instance defaultTcpipStack: it is the host's default instance");
    EXPECT_EQ(FailureOf([&] { info.RemoveNetstackInstance("nosuch", false); }),
              "Netstack instance nosuch does not exist");
    info.RemoveNetstackInstance("vmotionStack", false);
    EXPECT_EQ(Netstack("vmotionStack"), nullptr);
}

TEST(RoutingHost, RoutesGoThroughTheInterfaceThatReachesTheirGateway) {
    TempHost host;
    RoutingInfoImpl routing("defaultTcpipStack");
    EXPECT_EQ(Ipv4Routes(routing), (Names{"192.0.2.0/24 via 0.0.0.0 on tsl0", "198.51.100.0/24 via 192.0.2.254 on tsl0",
                                          "0.0.0.0/0 via 192.0.2.1 on tsl0"}));
    EXPECT_EQ(Ipv6Routes(routing), (Names{"2001:db8::/64 via :: on tsl0", "::/0 via 2001:db8::1 on tsl0"}));
    EXPECT_EQ(routing.GetDefaultGatewaySource(RoutingInfoImpl::DEFAULT_IPV4_ROUTE), "MANUAL");

    const Ipv4Network lab("203.0.113.0/24");
    EXPECT_EQ(FailureOf([&] { routing.AddTesselRoute(lab, Ipv4Address("10.0.0.1")); }),
              "Unable to add the route to 203.0.113.0/24 via 10.0.0.1: the gateway 10.0.0.1 is on no subnet of the "
              "interfaces of netstack defaultTcpipStack");
    EXPECT_EQ(FailureOf([&] { routing.AddTesselRoute(lab, Ipv4Address("224.0.0.1")); }),
              "Unable to add the route to 203.0.113.0/24 via 224.0.0.1: the gateway 224.0.0.1 cannot be used");
    EXPECT_EQ(FailureOf([&] { routing.AddTesselRoute(Ipv4Network("198.51.100.7/24"), Ipv4Address("192.0.2.2")); }),
              "Unable to add the route to 198.51.100.0/24 via 192.0.2.2: netstack defaultTcpipStack has a route to "
              "that network already, via 192.0.2.254");
    // IPv6 networks are compared without their host bits.
    routing.AddIpv6TesselRoute(Ipv6Network("2001:db8:5::1/48"), Ipv6Address("2001:db8::fe"));
    EXPECT_EQ(FailureOf([&] { routing.AddIpv6TesselRoute(Ipv6Network("2001:db8:5::/48"), Ipv6Address("2001:db8::fd")); }),
              "Unable to add the route to 2001:db8:5::/48 via 2001:db8::fd: netstack defaultTcpipStack has a route to "
              "that network already, via 2001:db8::fe");
    routing.RemoveIpv6TesselRoute(Ipv6Network("2001:db8:5::9/48"), Ipv6Address("2001:db8::fe"));
    EXPECT_EQ(FailureOf([&] { routing.RemoveTesselRoute(lab, Ipv4Address("192.0.2.1")); }),
              "Unable to remove the route to 203.0.113.0/24 via 192.0.2.1: netstack defaultTcpipStack has no such route");

    // A gateway no interface reaches any more is configured, not in force.
    std::unique_ptr<Gantry::Network::TslNic> tsl0(
        Trellis::Network::TesselNicInfoImpl().GetTesselNicByInterface("tsl0", false));
    Gantry::Network::IpConfig moved = tsl0->GetIpConfig();
    moved.SetIpv4Address(Ipv4Address("198.51.100.10"));
    tsl0->SetIpConfig(moved);
    EXPECT_EQ(routing.GetTesselDefaultGateway().GetStringAddress(), "0.0.0.0");
    EXPECT_EQ(routing.GetTesselConfigDefaultGateway().GetStringAddress(), "192.0.2.1");
    routing.SetTesselDefaultGateway(Ipv4Address("0.0.0.0"), false);
    EXPECT_EQ(routing.GetTesselConfigDefaultGateway().GetStringAddress(), "0.0.0.0");
}

TEST(RoutingHost, NeighboursByInterfaceAndWhatRemovingAnInterfaceTakesWithIt) {
    TempHost host;
    RoutingInfoImpl routing("defaultTcpipStack");
    std::vector<Gantry::Network::Ipv4Neighbor> ipv4;
    routing.GetCurrentIpv4TesselNeighbors(ipv4, "tsl0");
    ASSERT_EQ(ipv4.size(), 2u);
    EXPECT_EQ(routing.GetIpv4NeighborType(ipv4[0]), "Dynamic");
    std::vector<Gantry::Network::Ipv6Neighbor> ipv6;
    routing.GetCurrentIpv6TesselNeighbors(ipv6, "");
    ASSERT_EQ(ipv6.size(), 1u);
    EXPECT_EQ(routing.GetIpv6NeighborType(ipv6[0]) + " " + routing.GetIpv6NeighborState(ipv6[0]), "Router Reachable");
    ipv4.clear();
    routing.GetCurrentIpv4TesselNeighbors(ipv4, "tsl5");
    EXPECT_TRUE(ipv4.empty());

    Gantry::Network::Ipv4Neighbor gone{Ipv4Address("192.0.2.77"), "", "", 0};
    EXPECT_EQ(FailureOf([&] { routing.RemoveIpv4Neighbor(gone); }),
              "Netstack instance defaultTcpipStack has no neighbour entry for 192.0.2.77");
    routing.RemoveIpv4Neighbor({Ipv4Address("192.0.2.254"), "", "", 0});  // on every interface
    ipv4.clear();
    routing.GetCurrentIpv4TesselNeighbors(ipv4, "");
    EXPECT_EQ(ipv4.size(), 1u);
    EXPECT_EQ(FailureOf([&] { RoutingInfoImpl("nosuch").GetCurrentTesselRoutes(); }),
              "Netstack instance nosuch does not exist");

    std::unique_ptr<Gantry::Network::TslNic>(
        Trellis::Network::TesselNicInfoImpl().GetTesselNicByInterface("tsl0", false))->Remove();
    EXPECT_EQ(Section("netstacks")[0]["routing"], Json::parse(R"({"ipv4Routes": [], "ipv6Routes": [],
                                                                   "ipv4Neighbors": [], "ipv6Neighbors": []})"));
}
