#include "trellis/network/RoutingInfoImpl.h"

#include <algorithm>

#include "RoutingStore.h"
#include "gantry/lib/GantryException.h"
#include "trellis/host/Operation.h"
#include "trellis/host/records/NetstackRecord.h"

namespace Trellis {
namespace Network {

namespace {

using Gantry::Network::Ipv4Address;
using Gantry::Network::Ipv4Network;
using Gantry::Network::Ipv6Address;
using Gantry::Network::Ipv6Network;
using Trellis::Host::NeighborRecord;
using Trellis::Host::NetstackRecord;
using Trellis::Host::Operation;
using Trellis::Host::RouteRecord;
using Trellis::Host::Transaction;

const Operation kAddTesselRoute("RoutingInfoImpl::AddTesselRoute");
const Operation kRemoveTesselRoute("RoutingInfoImpl::RemoveTesselRoute");
const Operation kAddIpv6TesselRoute("RoutingInfoImpl::AddIpv6TesselRoute");
const Operation kRemoveIpv6TesselRoute("RoutingInfoImpl::RemoveIpv6TesselRoute");
const Operation kGetCurrentTesselRoutes("RoutingInfoImpl::GetCurrentTesselRoutes");
const Operation kGetCurrentIpv6TesselRoutes("RoutingInfoImpl::GetCurrentIpv6TesselRoutes");
const Operation kGetDefaultGatewaySource("RoutingInfoImpl::GetDefaultGatewaySource");
const Operation kGetTesselDefaultGateway("RoutingInfoImpl::GetTesselDefaultGateway");
const Operation kGetTesselConfigDefaultGateway("RoutingInfoImpl::GetTesselConfigDefaultGateway");
const Operation kGetIpv6TesselDefaultGateway("RoutingInfoImpl::GetIpv6TesselDefaultGateway");
const Operation kGetIpv6TesselConfigDefaultGateway("RoutingInfoImpl::GetIpv6TesselConfigDefaultGateway");
const Operation kSetTesselDefaultGateway("RoutingInfoImpl::SetTesselDefaultGateway");
const Operation kSetIpv6TesselDefaultGateway("RoutingInfoImpl::SetIpv6TesselDefaultGateway");
const Operation kGetCurrentIpv4TesselNeighbors("RoutingInfoImpl::GetCurrentIpv4TesselNeighbors");
const Operation kGetCurrentIpv6TesselNeighbors("RoutingInfoImpl::GetCurrentIpv6TesselNeighbors");
const Operation kGetIpv4NeighborType("RoutingInfoImpl::GetIpv4NeighborType");
const Operation kGetIpv6NeighborType("RoutingInfoImpl::GetIpv6NeighborType");
const Operation kGetIpv6NeighborState("RoutingInfoImpl::GetIpv6NeighborState");
const Operation kRemoveIpv4Neighbor("RoutingInfoImpl::RemoveIpv4Neighbor");
const Operation kRemoveIpv6Neighbor("RoutingInfoImpl::RemoveIpv6Neighbor");

constexpr const char* kIpv4TypeTexts[] = {"Dynamic", "Static", "Local"};
constexpr const char* kIpv6TypeTexts[] = {"Router", "Host"};
constexpr const char* kIpv6StateTexts[] = {"Reachable", "Stale", "Delay", "Probe", "Incomplete"};

[[noreturn]] void Refuse(std::string const& message) { throw Gantry::Lib::GantryException(message); }

// The two families told apart once, so that each rule is written once.
struct Ipv4Family {
    using Address = Ipv4Address;
    using Network = Ipv4Network;
    static Network Default() { return RoutingInfoImpl::DEFAULT_IPV4_ROUTE; }
    static Network Normal(Network const& network) { return network; }
    static std::vector<RouteRecord>& Routes(Trellis::Host::RoutingRecord& r) { return r.ipv4Routes; }
    static std::string& Gateway(Trellis::Host::RoutingRecord& r) { return r.ipv4Gateway; }
    static std::vector<RoutingStore::Ipv4Subnet> Subnets(Transaction const& t, std::string const& key) {
        return RoutingStore::Ipv4Subnets(t, key);
    }
    static bool IsUnusable(Address const& gateway) {
        return gateway.GetValue() == 0 || (gateway.GetValue() >> 28) == 0xE || gateway.GetValue() == 0xFFFFFFFFu;
    }
};

struct Ipv6Family {
    using Address = Ipv6Address;
    using Network = Ipv6Network;
    static Network Default() { return RoutingInfoImpl::DEFAULT_IPV6_ROUTE; }
    static Network Normal(Network const& network) { return RoutingStore::Masked(network); }
    static std::vector<RouteRecord>& Routes(Trellis::Host::RoutingRecord& r) { return r.ipv6Routes; }
    static std::string& Gateway(Trellis::Host::RoutingRecord& r) { return r.ipv6Gateway; }
    static std::vector<RoutingStore::Ipv6Subnet> Subnets(Transaction const& t, std::string const& key) {
        return RoutingStore::Ipv6Subnets(t, key);
    }
    static bool IsUnusable(Address const& gateway) {
        auto bytes = gateway.GetBytes();
        return bytes == std::array<std::uint8_t, 16>{} || bytes[0] == 0xFF;
    }
};

template <class F>
void CheckGateway(Transaction const& t, std::string const& key, typename F::Address const& gateway,
                  std::string const& refusal) {
    if (F::IsUnusable(gateway)) Refuse(refusal + "the gateway " + gateway.GetStringAddress() + " cannot be used");
    if (RoutingStore::InterfaceOf(F::Subnets(t, key), gateway).empty())
        Refuse(refusal + "the gateway " + gateway.GetStringAddress() + " is on no subnet of the interfaces of netstack " +
               key);
}

template <class F>
void AddRoute(Operation const& operation, std::string const& key, typename F::Network network,
              typename F::Address gateway) {
    operation.Write([&](Transaction& t) {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, key);
        network = F::Normal(network);
        const std::string refusal = "Unable to add the route to " + network.GetStringAddress() + " via " +
                                    gateway.GetStringAddress() + ": ";
        CheckGateway<F>(t, key, gateway, refusal);
        if (network == F::Default()) {
            std::string& current = F::Gateway(netstack.routing);
            if (!current.empty()) Refuse(refusal + "netstack " + key + " has a default gateway already, " + current);
            current = gateway.GetStringAddress();
        } else {
            for (RouteRecord const& route : F::Routes(netstack.routing))
                if (typename F::Network(route.network) == network)
                    Refuse(refusal + "netstack " + key + " has a route to that network already, via " + route.gateway);
            F::Routes(netstack.routing).push_back({network.GetStringAddress(), gateway.GetStringAddress()});
        }
        t.Put(netstack);
    });
}

template <class F>
void RemoveRoute(Operation const& operation, std::string const& key, typename F::Network network,
                 typename F::Address gateway) {
    operation.Write([&](Transaction& t) {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, key);
        network = F::Normal(network);
        const std::string missing = "Unable to remove the route to " + network.GetStringAddress() + " via " +
                                    gateway.GetStringAddress() + ": netstack " + key + " has no such route";
        if (network == F::Default()) {
            std::string& current = F::Gateway(netstack.routing);
            if (current.empty() || typename F::Address(current) != gateway) Refuse(missing);
            current.clear();
        } else {
            auto& routes = F::Routes(netstack.routing);
            auto found = std::find_if(routes.begin(), routes.end(), [&](RouteRecord const& route) {
                return typename F::Network(route.network) == network && typename F::Address(route.gateway) == gateway;
            });
            if (found == routes.end()) Refuse(missing);
            routes.erase(found);
        }
        t.Put(netstack);
    });
}

// The default gateway in force: the one configured while an interface of
// the netstack (subnets) reaches it.
template <class F, class Subnets>
typename F::Address GatewayInForce(NetstackRecord& netstack, Subnets const& subnets) {
    const std::string& gateway = F::Gateway(netstack.routing);
    if (gateway.empty()) return typename F::Address();
    typename F::Address address(gateway);
    return RoutingStore::InterfaceOf(subnets, address).empty() ? typename F::Address() : address;
}

template <class F>
typename F::Address GatewayInForce(Transaction const& t, std::string const& key) {
    NetstackRecord netstack = RoutingStore::RequireNetstack(t, key);
    return GatewayInForce<F>(netstack, F::Subnets(t, key));
}

// The routes in force: each interface's own subnet, then the routes, then the
// default route while an interface reaches the default gateway.
template <class F, class Route>
std::vector<Route> RoutesInForce(Transaction const& t, std::string const& key) {
    NetstackRecord netstack = RoutingStore::RequireNetstack(t, key);
    const auto subnets = F::Subnets(t, key);
    std::vector<Route> routes;
    for (auto const& subnet : subnets) routes.push_back({subnet.network, typename F::Address(), subnet.interfaceName});
    for (RouteRecord const& route : F::Routes(netstack.routing)) {
        typename F::Address gateway(route.gateway);
        routes.push_back({typename F::Network(route.network), gateway, RoutingStore::InterfaceOf(subnets, gateway)});
    }
    typename F::Address gateway = GatewayInForce<F>(netstack, subnets);
    if (gateway != typename F::Address())
        routes.push_back({F::Default(), gateway, RoutingStore::InterfaceOf(subnets, gateway)});
    return routes;
}

template <class F>
typename F::Address ConfiguredGateway(Transaction const& t, std::string const& key) {
    NetstackRecord netstack = RoutingStore::RequireNetstack(t, key);
    const std::string& gateway = F::Gateway(netstack.routing);
    return gateway.empty() ? typename F::Address() : typename F::Address(gateway);
}

template <class Neighbor>
Neighbor NeighborOf(NeighborRecord const& record) {
    Neighbor neighbor;
    neighbor.address = decltype(neighbor.address)(record.address);
    neighbor.macAddress = record.macAddress;
    neighbor.interfaceName = record.interfaceName;
    neighbor.expiry = record.expiry;
    return neighbor;
}

// Whether the entry is the neighbour's: its address, on its interface (any,
// when it names none).
template <class Neighbor>
bool IsEntryOf(NeighborRecord const& record, Neighbor const& neighbor) {
    return decltype(neighbor.address)(record.address) == neighbor.address &&
           (neighbor.interfaceName.empty() || record.interfaceName == neighbor.interfaceName);
}

template <class Neighbor>
NeighborRecord const& RequireNeighbor(std::vector<NeighborRecord> const& table, Neighbor const& neighbor,
                                      std::string const& key) {
    for (NeighborRecord const& record : table)
        if (IsEntryOf(record, neighbor)) return record;
    Refuse("Netstack instance " + key + " has no neighbour entry for " + neighbor.address.GetStringAddress() +
           (neighbor.interfaceName.empty() ? "" : " on " + neighbor.interfaceName));
}

template <class Neighbor>
void RemoveNeighbor(Operation const& operation, std::string const& key, Neighbor const& neighbor, bool ipv6) {
    operation.Write([&](Transaction& t) {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, key);
        auto& table = ipv6 ? netstack.routing.ipv6Neighbors : netstack.routing.ipv4Neighbors;
        RequireNeighbor(table, neighbor, key);
        table.erase(std::remove_if(table.begin(), table.end(),
                                   [&](NeighborRecord const& record) { return IsEntryOf(record, neighbor); }),
                    table.end());
        t.Put(netstack);
    });
}

}  // namespace

const Ipv4Network RoutingInfoImpl::DEFAULT_IPV4_ROUTE = Ipv4Network();
const Ipv6Network RoutingInfoImpl::DEFAULT_IPV6_ROUTE = Ipv6Network();

RoutingInfoImpl::RoutingInfoImpl(std::string const& netstackKey) : netstackKey_(netstackKey) {}

RoutingInfoImpl::~RoutingInfoImpl() {}

void RoutingInfoImpl::SetNetstackInstanceKey(std::string const& netstackKey) { netstackKey_ = netstackKey; }

void RoutingInfoImpl::AddTesselRoute(Ipv4Network network, Ipv4Address gateway) {
    AddRoute<Ipv4Family>(kAddTesselRoute, netstackKey_, network, gateway);
}

void RoutingInfoImpl::RemoveTesselRoute(Ipv4Network network, Ipv4Address gateway) {
    RemoveRoute<Ipv4Family>(kRemoveTesselRoute, netstackKey_, network, gateway);
}

void RoutingInfoImpl::AddIpv6TesselRoute(Ipv6Network network, Ipv6Address gateway) {
    AddRoute<Ipv6Family>(kAddIpv6TesselRoute, netstackKey_, network, gateway);
}

void RoutingInfoImpl::RemoveIpv6TesselRoute(Ipv6Network network, Ipv6Address gateway) {
    RemoveRoute<Ipv6Family>(kRemoveIpv6TesselRoute, netstackKey_, network, gateway);
}

std::vector<Gantry::Network::Ipv4Route> RoutingInfoImpl::GetCurrentTesselRoutes() {
    return kGetCurrentTesselRoutes.Read(
        [&](Transaction& t) { return RoutesInForce<Ipv4Family, Gantry::Network::Ipv4Route>(t, netstackKey_); });
}

std::vector<Gantry::Network::Ipv6Route> RoutingInfoImpl::GetCurrentIpv6TesselRoutes() {
    return kGetCurrentIpv6TesselRoutes.Read(
        [&](Transaction& t) { return RoutesInForce<Ipv6Family, Gantry::Network::Ipv6Route>(t, netstackKey_); });
}

std::string RoutingInfoImpl::GetDefaultGatewaySource(Ipv4Network network) {
    return kGetDefaultGatewaySource.Read([&](Transaction& t) -> std::string {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, netstackKey_);
        return network == DEFAULT_IPV4_ROUTE && netstack.routing.ipv4GatewaySource == 1 ? "DHCP" : "MANUAL";
    });
}

Ipv4Address RoutingInfoImpl::GetTesselDefaultGateway() {
    return kGetTesselDefaultGateway.Read([&](Transaction& t) { return GatewayInForce<Ipv4Family>(t, netstackKey_); });
}

Ipv4Address RoutingInfoImpl::GetTesselConfigDefaultGateway() {
    return kGetTesselConfigDefaultGateway.Read(
        [&](Transaction& t) { return ConfiguredGateway<Ipv4Family>(t, netstackKey_); });
}

Ipv6Address RoutingInfoImpl::GetIpv6TesselDefaultGateway() {
    return kGetIpv6TesselDefaultGateway.Read([&](Transaction& t) { return GatewayInForce<Ipv6Family>(t, netstackKey_); });
}

Ipv6Address RoutingInfoImpl::GetIpv6TesselConfigDefaultGateway() {
    return kGetIpv6TesselConfigDefaultGateway.Read(
        [&](Transaction& t) { return ConfiguredGateway<Ipv6Family>(t, netstackKey_); });
}

void RoutingInfoImpl::SetTesselDefaultGateway(Ipv4Address gateway, bool /*flag*/) {
    kSetTesselDefaultGateway.Write([&](Transaction& t) {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, netstackKey_);
        if (gateway.GetValue() != 0)
            CheckGateway<Ipv4Family>(t, netstackKey_, gateway, "Unable to set the default gateway: ");
        netstack.routing.ipv4Gateway = gateway.GetValue() == 0 ? "" : gateway.GetStringAddress();
        netstack.routing.ipv4GatewaySource = 0;
        t.Put(netstack);
    });
}

void RoutingInfoImpl::SetIpv6TesselDefaultGateway(Ipv6Address gateway) {
    kSetIpv6TesselDefaultGateway.Write([&](Transaction& t) {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, netstackKey_);
        const bool clear = gateway == Ipv6Address();
        if (!clear) CheckGateway<Ipv6Family>(t, netstackKey_, gateway, "Unable to set the default gateway: ");
        netstack.routing.ipv6Gateway = clear ? "" : gateway.GetStringAddress();
        t.Put(netstack);
    });
}

void RoutingInfoImpl::GetCurrentIpv4TesselNeighbors(std::vector<Gantry::Network::Ipv4Neighbor>& neighbors,
                                                    std::string const& interfaceName) {
    NetstackRecord netstack = kGetCurrentIpv4TesselNeighbors.Read(
        [&](Transaction& t) { return RoutingStore::RequireNetstack(t, netstackKey_); });
    for (NeighborRecord const& record : netstack.routing.ipv4Neighbors)
        if (interfaceName.empty() || record.interfaceName == interfaceName)
            neighbors.push_back(NeighborOf<Gantry::Network::Ipv4Neighbor>(record));
}

void RoutingInfoImpl::GetCurrentIpv6TesselNeighbors(std::vector<Gantry::Network::Ipv6Neighbor>& neighbors,
                                                    std::string const& interfaceName) {
    NetstackRecord netstack = kGetCurrentIpv6TesselNeighbors.Read(
        [&](Transaction& t) { return RoutingStore::RequireNetstack(t, netstackKey_); });
    for (NeighborRecord const& record : netstack.routing.ipv6Neighbors)
        if (interfaceName.empty() || record.interfaceName == interfaceName)
            neighbors.push_back(NeighborOf<Gantry::Network::Ipv6Neighbor>(record));
}

std::string RoutingInfoImpl::GetIpv4NeighborType(Gantry::Network::Ipv4Neighbor neighbor) {
    return kGetIpv4NeighborType.Read([&](Transaction& t) -> std::string {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, netstackKey_);
        return kIpv4TypeTexts[RequireNeighbor(netstack.routing.ipv4Neighbors, neighbor, netstackKey_).type];
    });
}

std::string RoutingInfoImpl::GetIpv6NeighborType(Gantry::Network::Ipv6Neighbor neighbor) {
    return kGetIpv6NeighborType.Read([&](Transaction& t) -> std::string {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, netstackKey_);
        return kIpv6TypeTexts[RequireNeighbor(netstack.routing.ipv6Neighbors, neighbor, netstackKey_).type];
    });
}

std::string RoutingInfoImpl::GetIpv6NeighborState(Gantry::Network::Ipv6Neighbor neighbor) {
    return kGetIpv6NeighborState.Read([&](Transaction& t) -> std::string {
        NetstackRecord netstack = RoutingStore::RequireNetstack(t, netstackKey_);
        return kIpv6StateTexts[RequireNeighbor(netstack.routing.ipv6Neighbors, neighbor, netstackKey_).state];
    });
}

void RoutingInfoImpl::RemoveIpv4Neighbor(Gantry::Network::Ipv4Neighbor neighbor) {
    RemoveNeighbor(kRemoveIpv4Neighbor, netstackKey_, neighbor, false);
}

void RoutingInfoImpl::RemoveIpv6Neighbor(Gantry::Network::Ipv6Neighbor neighbor) {
    RemoveNeighbor(kRemoveIpv6Neighbor, netstackKey_, neighbor, true);
}

}  // namespace Network
}  // namespace Trellis
