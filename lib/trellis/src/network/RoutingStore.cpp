#include "RoutingStore.h"

#include <algorithm>
#include <optional>

#include "TslNicStore.h"
#include "gantry/lib/GantryException.h"
#include "host/StoredText.h"

namespace Trellis {
namespace Network {
namespace RoutingStore {

using Gantry::Network::Ipv4Address;
using Gantry::Network::Ipv4Network;
using Gantry::Network::Ipv6Address;
using Gantry::Network::Ipv6Network;
using Trellis::Host::NetstackRecord;
using Trellis::Host::Transaction;
using Trellis::Host::TslNicRecord;

NetstackRecord RequireNetstack(Transaction const& t, std::string const& key) {
    std::optional<NetstackRecord> netstack = t.Find<NetstackRecord>(key);
    if (!netstack)
        throw Gantry::Lib::GantryException("Netstack instance " + Trellis::Host::Printable(key) + " does not exist");
    return *netstack;
}

std::vector<Ipv4Subnet> Ipv4Subnets(Transaction const& t, std::string const& key) {
    std::vector<Ipv4Subnet> subnets;
    for (TslNicRecord const& nic : t.ChildrenOf<TslNicRecord>(key)) {
        Gantry::Network::IpConfig config = TslNicStore::IpConfigInForce(nic);
        if (config.GetIpv4UseNone() || config.GetIpv4Address().GetValue() == 0) continue;
        subnets.push_back({nic.name, Ipv4Network(config.GetIpv4Address(), config.GetIpv4Netmask())});
    }
    return subnets;
}

std::vector<Ipv6Subnet> Ipv6Subnets(Transaction const& t, std::string const& key) {
    std::vector<Ipv6Subnet> subnets;
    for (TslNicRecord const& nic : t.ChildrenOf<TslNicRecord>(key))
        for (Ipv6Network const& network : TslNicStore::IpConfigInForce(nic).GetIpv6Network())
            subnets.push_back({nic.name, Masked(network)});
    return subnets;
}

std::string InterfaceOf(std::vector<Ipv4Subnet> const& subnets, Ipv4Address const& address) {
    for (Ipv4Subnet const& subnet : subnets) {
        const std::uint32_t mask = subnet.network.GetNetmask().GetValue();
        if ((address.GetValue() & mask) == subnet.network.GetNetwork().GetValue()) return subnet.interfaceName;
    }
    return "";
}

std::string InterfaceOf(std::vector<Ipv6Subnet> const& subnets, Ipv6Address const& address) {
    for (Ipv6Subnet const& subnet : subnets)
        if (Masked(Ipv6Network(address, subnet.network.GetNetmask())) == subnet.network) return subnet.interfaceName;
    return "";
}

Ipv6Network Masked(Ipv6Network const& network) {
    std::array<std::uint8_t, 16> bytes = network.GetAddress().GetBytes();
    const unsigned int prefix = network.GetNetmask();
    for (unsigned int bit = prefix; bit < 128; ++bit) bytes[bit / 8] &= static_cast<std::uint8_t>(~(0x80u >> (bit % 8)));
    return Ipv6Network(Ipv6Address(bytes), prefix);
}

void DropInterface(Transaction& t, TslNicRecord const& nic, std::vector<Ipv4Subnet> const& ipv4Before,
                   std::vector<Ipv6Subnet> const& ipv6Before) {
    std::optional<NetstackRecord> netstack = t.Find<NetstackRecord>(nic.netstack);
    if (!netstack) return;
    Trellis::Host::RoutingRecord& routing = netstack->routing;
    const std::vector<Ipv4Subnet> ipv4After = Ipv4Subnets(t, nic.netstack);
    const std::vector<Ipv6Subnet> ipv6After = Ipv6Subnets(t, nic.netstack);
    // A gateway the interface reached that no other interface reaches.
    auto lost4 = [&](std::string const& gateway) {
        Ipv4Address address(gateway);
        return InterfaceOf(ipv4Before, address) == nic.name && InterfaceOf(ipv4After, address).empty();
    };
    auto lost6 = [&](std::string const& gateway) {
        Ipv6Address address(gateway);
        return InterfaceOf(ipv6Before, address) == nic.name && InterfaceOf(ipv6After, address).empty();
    };
    auto erase = [](auto& entries, auto&& drop) {
        entries.erase(std::remove_if(entries.begin(), entries.end(), drop), entries.end());
    };
    erase(routing.ipv4Routes, [&](Trellis::Host::RouteRecord const& route) { return lost4(route.gateway); });
    erase(routing.ipv6Routes, [&](Trellis::Host::RouteRecord const& route) { return lost6(route.gateway); });
    if (!routing.ipv4Gateway.empty() && lost4(routing.ipv4Gateway)) routing.ipv4Gateway.clear();
    if (!routing.ipv6Gateway.empty() && lost6(routing.ipv6Gateway)) routing.ipv6Gateway.clear();
    auto onInterface = [&](Trellis::Host::NeighborRecord const& neighbor) { return neighbor.interfaceName == nic.name; };
    erase(routing.ipv4Neighbors, onInterface);
    erase(routing.ipv6Neighbors, onInterface);
    t.Put(*netstack);
}

}  // namespace RoutingStore
}  // namespace Network
}  // namespace Trellis
