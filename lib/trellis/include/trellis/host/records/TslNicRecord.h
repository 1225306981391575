#pragma once

// A kernel network interface ("tsl0"): where it is attached, its netstack,
// its settings, its IP configuration as configured, and its tags. What is in
// force (a DHCP lease, addresses the host obtains itself) is derived from it
// when read.

#include <cstdint>
#include <string>
#include <vector>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

enum class ConnectionKind { None, PortGroup, DVPort, OpaqueNetwork };

struct ConnectionRecord {
    ConnectionKind kind = ConnectionKind::None;
    std::string portGroup;   // PortGroup
    std::string dvSwitch;    // DVPort: the switch's name
    std::string dvPort;      // DVPort: the port id
    std::uint32_t connectionId = 0;  // DVPort
    std::string networkId;   // OpaqueNetwork
    std::string networkType;
    std::string externalId;

    Json ToJson() const;
    static ConnectionRecord FromJson(const JsonReader& in);  // absent: None
};

enum class Ipv4Mode { Static, Dhcp, None };
inline constexpr const char* kIpv4ModeWords[] = {"static", "dhcp", "none"};

// Statuses of an IPv6 address as descriptions write them, by the host's codes.
inline constexpr const char* kIpv6StatusWords[] = {"tentative", "duplicated", "preferred", "deprecated"};

struct Ipv6AddressRecord {
    std::string network;  // "2001:db8::10/64", as given
    int status = 4;       // the host's code: 2, 3, 4 or 5
};

struct TslNicRecord {
    static constexpr const char* kKind = "tslnic";
    static constexpr int kMaxNumber = 255;  // tsl0 to tsl255
    static constexpr int kDefaultMtu = 1500;
    static constexpr int kDefaultTsoMss = 65535;

    std::string name;
    std::string macAddress;  // lower case with colons
    int mtu = kDefaultMtu;
    int tsoMss = kDefaultTsoMss;
    bool enabled = true;
    std::string netstack = "defaultTcpipStack";
    ConnectionRecord connection;
    Ipv4Mode ipv4Mode = Ipv4Mode::None;
    std::string ipv4Address;  // static mode only
    std::string ipv4Netmask;
    bool dhcpDns = false;
    bool ipv6Dhcp = false;
    bool ipv6RouterAdvertised = false;
    std::vector<Ipv6AddressRecord> ipv6Addresses;  // the static ones
    std::vector<int> tags;  // TslNicTagType ids, in the order they were added

    // The N of tslN; -1 for another name.
    static int NumberOf(std::string const& name);
    std::string Parent() const { return netstack; }
    Json ToJson() const;
    static TslNicRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
