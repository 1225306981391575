#include "TslNicStore.h"

#include <arpa/inet.h>

#include <array>
#include <cstdio>
#include <vector>

#include "RoutingStore.h"
#include "gantry/lib/GantryException.h"
#include "gantry/network/MacAddress.h"
#include "host/StoredText.h"
#include "trellis/host/records/NetstackRecord.h"
#include "trellis/host/records/SwitchRecords.h"

namespace Trellis {
namespace Network {
namespace TslNicStore {

using Gantry::Network::IpConfig;
using Gantry::Network::Ipv4Address;
using Gantry::Network::Ipv6Network;
using Trellis::Host::Ipv4Mode;
using Trellis::Host::PortRecord;
using Trellis::Host::Transaction;
using Trellis::Host::TslNicRecord;

namespace {

[[noreturn]] void Refuse(std::string const& message) { throw Gantry::Lib::GantryException(message); }

Ipv4Address Lease(TslNicRecord const& nic) {
    return Ipv4Address(0xCB007100u + 10u + static_cast<std::uint32_t>(TslNicRecord::NumberOf(nic.name) % 240));
}

Ipv6Network AutoconfAddress(TslNicRecord const& nic) {
    Gantry::Network::MacAddress mac(nic.macAddress);
    char text[64];
    unsigned int b[6];
    std::sscanf(mac.GetStringAddress().c_str(), "%x:%x:%x:%x:%x:%x", &b[0], &b[1], &b[2], &b[3], &b[4], &b[5]);
    std::snprintf(text, sizeof text, "2001:db8:0:1:%x:%xff:fe%02x:%x/64", ((b[0] ^ 0x02) << 8) | b[1], b[2], b[3],
                  (b[4] << 8) | b[5]);
    Ipv6Network network(text);
    network.SetIpv6AddressType(Ipv6Network::TYPE_AUTOCONF);
    return network;
}

Ipv6Network DhcpAddress(TslNicRecord const& nic) {
    Ipv6Network network("2001:db8:0:2::" + std::to_string(TslNicRecord::NumberOf(nic.name) + 1) + "/64");
    network.SetIpv6AddressType(Ipv6Network::TYPE_DHCP);
    return network;
}

IpConfig BaseConfig(TslNicRecord const& nic) {
    IpConfig config;
    if (nic.ipv4Mode == Ipv4Mode::Static) {
        config.SetIpv4Address(Ipv4Address(nic.ipv4Address));
        config.SetIpv4Netmask(Ipv4Address(nic.ipv4Netmask));
    } else if (nic.ipv4Mode == Ipv4Mode::Dhcp) {
        config.SetUseDhcp(true);
    } else {
        config.SetIpv4UseNone();
    }
    config.SetDhcpDns(nic.dhcpDns);
    config.SetUseIpv6Dhcp(nic.ipv6Dhcp);
    config.SetUseIpv6RouterAdvertised(nic.ipv6RouterAdvertised);
    for (Trellis::Host::Ipv6AddressRecord const& address : nic.ipv6Addresses) {
        Ipv6Network network(address.network);
        network.SetIpv6AddressStatus(address.status);
        config.AddIpv6Network(network);
    }
    return config;
}

bool IsContiguous(std::uint32_t mask) {
    std::uint32_t inverted = ~mask;
    return (inverted & (inverted + 1)) == 0;
}

// Why the host will not give an interface this address on this netmask; ""
// when it will.
std::string Ipv4Problem(std::uint32_t address, std::uint32_t mask) {
    if (address == 0) return "it is the unspecified address";
    if ((address >> 24) == 127) return "it is a loopback address";
    if ((address >> 28) == 0xE) return "it is a multicast address";
    if (address == 0xFFFFFFFFu) return "it is the broadcast address";
    if ((address >> 28) == 0xF) return "it is a reserved address";
    if (~mask > 1) {  // networks of more than two addresses reserve their first and last
        if ((address & ~mask) == 0) return "it is the address of its network";
        if ((address & ~mask) == ~mask) return "it is the broadcast address of its network";
    }
    return "";
}

std::string Ipv6Problem(Ipv6Network const& network) {
    std::array<std::uint8_t, 16> bytes = network.GetAddress().GetBytes();
    std::array<std::uint8_t, 16> zero{};
    std::array<std::uint8_t, 16> loopback{};
    loopback[15] = 1;
    if (bytes == zero) return "it is the unspecified address";
    if (bytes == loopback) return "it is the loopback address";
    if (bytes[0] == 0xFF) return "it is a multicast address";
    if (network.GetNetmask() == 0) return "a prefix length of 0 leaves it no network";
    return "";
}

// The other interfaces of the netstack and their settings in force.
std::vector<std::pair<std::string, IpConfig>> Neighbours(Transaction const& t, TslNicRecord const& nic) {
    std::vector<std::pair<std::string, IpConfig>> others;
    for (TslNicRecord const& other : t.ChildrenOf<TslNicRecord>(nic.netstack))
        if (other.name != nic.name) others.emplace_back(other.name, IpConfigInForce(other));
    return others;
}

}  // namespace

TslNicRecord RequireTslNic(Transaction const& t, std::string const& name) {
    std::optional<TslNicRecord> nic = t.Find<TslNicRecord>(name);
    if (!nic) Refuse("Interface " + Trellis::Host::Printable(name) + " does not exist");
    return *nic;
}

void RequireNetstack(Transaction const& t, std::string const& key, std::string const& refusal) {
    if (!t.Contains<Trellis::Host::NetstackRecord>(key))
        Refuse(refusal + "there is no netstack instance " + Trellis::Host::Printable(key));
}

IpConfig ConfiguredIpConfig(TslNicRecord const& nic) { return BaseConfig(nic); }

IpConfig IpConfigInForce(TslNicRecord const& nic) {
    IpConfig config = BaseConfig(nic);
    if (nic.ipv4Mode == Ipv4Mode::Dhcp) {
        config.SetIpv4Address(Lease(nic));
        config.SetIpv4Netmask(Ipv4Address(0xFFFFFF00u));
        config.SetUseDhcp(true);
    }
    if (nic.ipv6RouterAdvertised) config.AddIpv6Network(AutoconfAddress(nic));
    if (nic.ipv6Dhcp) config.AddIpv6Network(DhcpAddress(nic));
    return config;
}

void StoreIpConfig(Transaction& t, TslNicRecord& nic, IpConfig const& config) {
    const std::string owner = " for interface " + nic.name + ": ";
    const auto others = Neighbours(t, nic);
    if (config.GetIpv4UseNone()) {
        nic.ipv4Mode = Ipv4Mode::None;
    } else if (config.GetUseDhcp()) {
        nic.ipv4Mode = Ipv4Mode::Dhcp;
    } else {
        const std::uint32_t address = config.GetIpv4Address().GetValue();
        const std::uint32_t mask = config.GetIpv4Netmask().GetValue();
        const std::string addressText = config.GetIpv4Address().GetStringAddress();
        if (mask == 0 || !IsContiguous(mask))
            Refuse("Invalid IPv4 netmask " + config.GetIpv4Netmask().GetStringAddress() + owner +
                   "a netmask is a run of one bits from the left, at least one");
        std::string problem = Ipv4Problem(address, mask);
        if (!problem.empty()) Refuse("Invalid IPv4 address " + addressText + owner + problem);
        for (auto const& other : others)
            if (other.second.GetIpv4Address().GetValue() == address)
                Refuse("Invalid IPv4 address " + addressText + owner + "interface " + other.first +
                       " of netstack " + nic.netstack + " has it already");
        nic.ipv4Mode = Ipv4Mode::Static;
        nic.ipv4Address = addressText;
        nic.ipv4Netmask = config.GetIpv4Netmask().GetStringAddress();
    }
    if (nic.ipv4Mode != Ipv4Mode::Static) {
        nic.ipv4Address.clear();
        nic.ipv4Netmask.clear();
    }
    nic.dhcpDns = config.GetDhcpDns();
    nic.ipv6Dhcp = config.GetUseIpv6Dhcp();
    nic.ipv6RouterAdvertised = config.GetUseIpv6RouterAdvertised();

    std::vector<Trellis::Host::Ipv6AddressRecord> addresses;
    for (Ipv6Network const& network : config.GetIpv6Network()) {
        if (network.GetIpv6AddressType() != Ipv6Network::TYPE_STATIC) continue;
        const std::string text = network.GetStringAddress();
        std::string problem = Ipv6Problem(network);
        if (!problem.empty()) Refuse("Invalid IPv6 address " + text + owner + problem);
        for (auto const& other : others)
            for (Ipv6Network const& taken : other.second.GetIpv6Network())
                if (taken.GetAddress() == network.GetAddress())
                    Refuse("Invalid IPv6 address " + text + owner + "interface " + other.first + " of netstack " +
                           nic.netstack + " has it already");
        int status = Ipv6Network::STATUS_PREFERRED;
        for (Trellis::Host::Ipv6AddressRecord const& kept : nic.ipv6Addresses)
            if (Ipv6Network(kept.network) == network) status = kept.status;
        addresses.push_back({text, status});
    }
    nic.ipv6Addresses = addresses;

    if (std::optional<PortRecord> port = PortOf(t, nic)) {
        port->ipv4Address = IpConfigInForce(nic).GetIpv4Address().GetStringAddress();
        if (port->ipv4Address == "0.0.0.0") port->ipv4Address.clear();
        t.Put(*port);
    }
}

void RemoveTslNic(Transaction& t, TslNicRecord const& nic) {
    const auto ipv4Before = RoutingStore::Ipv4Subnets(t, nic.netstack);
    const auto ipv6Before = RoutingStore::Ipv6Subnets(t, nic.netstack);
    if (std::optional<PortRecord> port = PortOf(t, nic)) t.Erase<PortRecord>(port->name);
    t.Erase<TslNicRecord>(nic.name);
    RoutingStore::DropInterface(t, nic, ipv4Before, ipv6Before);
}

std::string PortsetOf(Transaction const& t, TslNicRecord const& nic) {
    using Trellis::Host::ConnectionKind;
    if (nic.connection.kind == ConnectionKind::PortGroup) {
        std::optional<Trellis::Host::PortGroupRecord> group = t.Find<Trellis::Host::PortGroupRecord>(nic.connection.portGroup);
        return group ? group->vswitch : "";
    }
    if (nic.connection.kind == ConnectionKind::DVPort) return nic.connection.dvSwitch;
    return "";
}

std::optional<PortRecord> PortOf(Transaction const& t, TslNicRecord const& nic) {
    const std::string portset = PortsetOf(t, nic);
    if (portset.empty()) return std::nullopt;
    for (PortRecord& port : t.ChildrenOf<PortRecord>(portset))
        if (port.clientKind == Trellis::Host::PortClientKind::TesselNic && port.clientName == nic.name) return port;
    return std::nullopt;
}

}  // namespace TslNicStore
}  // namespace Network
}  // namespace Trellis
