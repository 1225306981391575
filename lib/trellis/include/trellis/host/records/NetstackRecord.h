#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// A route as configured: to a network (address/prefix, host bits cleared)
// through a gateway. Its interface is found when it is read: the one whose
// subnet holds the gateway.
struct RouteRecord {
    std::string network;
    std::string gateway;
};

inline constexpr const char* kIpv4NeighborTypeWords[] = {"dynamic", "static", "local"};
inline constexpr const char* kIpv6NeighborTypeWords[] = {"router", "host"};
inline constexpr const char* kIpv6NeighborStateWords[] = {"reachable", "stale", "delay", "probe", "incomplete"};

struct NeighborRecord {
    std::string address;
    std::string macAddress;
    std::string interfaceName;
    int expiry = 0;  // seconds
    int type = 0;    // an index into the type words of its family
    int state = 0;   // IPv6 only: an index into kIpv6NeighborStateWords
};

inline constexpr const char* kGatewaySourceWords[] = {"manual", "dhcp"};

// The routing of a netstack: default gateways (empty for none), routes and
// neighbour tables.
struct RoutingRecord {
    std::string ipv4Gateway;
    int ipv4GatewaySource = 0;  // an index into kGatewaySourceWords
    std::string ipv6Gateway;
    std::vector<RouteRecord> ipv4Routes;
    std::vector<RouteRecord> ipv6Routes;
    std::vector<NeighborRecord> ipv4Neighbors;
    std::vector<NeighborRecord> ipv6Neighbors;

    Json ToJson() const;
    static RoutingRecord FromJson(const JsonReader& in);  // absent: no routing
};

// The name servers (canonical address texts) and search domains of a
// netstack, each in the order they are used.
struct DnsRecord {
    std::vector<std::string> nameServers;
    std::vector<std::string> searchDomains;

    // The list's entry of the domain, compared without regard to case; end()
    // when it has none.
    std::vector<std::string>::iterator FindDomain(const std::string& domain);
    bool HasDomain(const std::string& domain) const;
    Json ToJson() const;
    static DnsRecord FromJson(const JsonReader& in);  // absent: none
};

inline constexpr const char* kSocketProtocolWords[] = {"tcp", "udp", "ip"};

// A connection of the netstack, as the kernel's tables show it; owned by a
// world.
struct SocketRecord {
    int protocol = 0;  // an index into kSocketProtocolWords
    int recvQueue = 0;
    int sendQueue = 0;
    std::string localAddress;
    int localPort = 0;
    std::string foreignAddress;
    int foreignPort = 0;
    int state = 0;  // TCP's state code, 0 to 10
    std::int64_t worldId = 0;
    std::string congestionControl;

    Json ToJson() const;
    static SocketRecord FromJson(const JsonReader& in);
};

// A netstack instance: a network stack of the kernel with its own interfaces
// and routes ("defaultTcpipStack"). The values in force change only when the
// instance is created in the kernel.
struct NetstackRecord {
    static constexpr const char* kKind = "netstack";
    static constexpr const char* kDefaultKey = "defaultTcpipStack";
    static constexpr int kMaxConnections = 1000000;

    std::string name;  // the key
    std::string displayName;
    bool inKernel = true;
    int maxConnections = 11000;
    int currentMaxConnections = 11000;
    std::string congestionControl = "newreno";
    bool ipv6Enabled = true;
    bool currentIpv6Enabled = true;
    RoutingRecord routing;
    DnsRecord dns;
    std::vector<SocketRecord> connections;

    Json ToJson() const;  // the key as "key", the display name as "name"
    static NetstackRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
