#include "trellis/host/records/NetstackRecord.h"

#include <algorithm>
#include <cctype>

#include <nlohmann/json.hpp>

#include "gantry/network/IpAddress.h"
#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv4Network.h"
#include "gantry/network/Ipv6Address.h"
#include "gantry/network/Ipv6Network.h"
#include "gantry/network/MacAddress.h"

namespace Trellis {
namespace Host {

namespace {

template <std::size_t N>
int WordIndex(const JsonReader& in, const char* key, const char* const (&words)[N]) {
    return static_cast<int>(in.Word(key, words, N));
}

std::string Address(const JsonReader& in, const char* key, bool ipv6) {
    std::string text = in.String(key);
    if (ipv6) {
        if (!Gantry::Network::Ipv6Address::IsValidAddress(text)) in.Member(key).Fail("expected an IPv6 address");
        return Gantry::Network::Ipv6Address(text).GetStringAddress();
    }
    if (!Gantry::Network::Ipv4Address::IsValidAddress(text)) in.Member(key).Fail("expected an IPv4 address");
    return Gantry::Network::Ipv4Address(text).GetStringAddress();
}

std::vector<RouteRecord> Routes(const JsonReader& in, const char* key, bool ipv6) {
    std::vector<RouteRecord> routes;
    for (const JsonReader& element : in.Array(key)) {
        RouteRecord route;
        std::string network = element.String("network");
        if (ipv6 ? !Gantry::Network::Ipv6Network::IsValidAddressAndNetmask(network)
                 : !Gantry::Network::Ipv4Network::IsValidAddressAndNetmask(network))
            element.Member("network").Fail("expected a network with its prefix length");
        route.network = network;
        route.gateway = Address(element, "gateway", ipv6);
        element.RejectUnknownMembers();
        routes.push_back(route);
    }
    return routes;
}

std::vector<NeighborRecord> Neighbors(const JsonReader& in, const char* key, bool ipv6) {
    std::vector<NeighborRecord> neighbors;
    for (const JsonReader& element : in.Array(key)) {
        NeighborRecord neighbor;
        neighbor.address = Address(element, "address", ipv6);
        std::string mac = element.String("macAddress");
        if (!mac.empty()) {
            try {
                mac = Gantry::Network::MacAddress(mac).GetStringAddress();
            } catch (const std::exception&) {
                element.Member("macAddress").Fail("expected a MAC address");
            }
        }
        neighbor.macAddress = mac;
        neighbor.interfaceName = element.String("interface");
        if (neighbor.interfaceName.empty()) element.Member("interface").Fail("expected an interface name");
        neighbor.expiry = static_cast<int>(element.Int("expiry", 0, 86400));
        if (ipv6) {
            neighbor.type = WordIndex(element, "type", kIpv6NeighborTypeWords);
            neighbor.state = WordIndex(element, "state", kIpv6NeighborStateWords);
        } else {
            neighbor.type = WordIndex(element, "type", kIpv4NeighborTypeWords);
        }
        element.RejectUnknownMembers();
        neighbors.push_back(neighbor);
    }
    return neighbors;
}

Json RoutesJson(const std::vector<RouteRecord>& routes) {
    Json list = Json::array();
    for (const RouteRecord& route : routes) list.push_back(Json{{"network", route.network}, {"gateway", route.gateway}});
    return list;
}

Json NeighborsJson(const std::vector<NeighborRecord>& neighbors, bool ipv6) {
    Json list = Json::array();
    for (const NeighborRecord& neighbor : neighbors) {
        Json entry{{"address", neighbor.address},
                   {"macAddress", neighbor.macAddress},
                   {"interface", neighbor.interfaceName},
                   {"expiry", neighbor.expiry}};
        entry["type"] = ipv6 ? kIpv6NeighborTypeWords[neighbor.type] : kIpv4NeighborTypeWords[neighbor.type];
        if (ipv6) entry["state"] = kIpv6NeighborStateWords[neighbor.state];
        list.push_back(entry);
    }
    return list;
}

bool SameDomain(const std::string& a, const std::string& b) {
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) {
               return std::tolower(static_cast<unsigned char>(x)) == std::tolower(static_cast<unsigned char>(y));
           });
}

}  // namespace

std::vector<std::string>::iterator DnsRecord::FindDomain(const std::string& domain) {
    return std::find_if(searchDomains.begin(), searchDomains.end(),
                        [&](const std::string& held) { return SameDomain(held, domain); });
}

bool DnsRecord::HasDomain(const std::string& domain) const {
    return std::any_of(searchDomains.begin(), searchDomains.end(),
                       [&](const std::string& held) { return SameDomain(held, domain); });
}

Json DnsRecord::ToJson() const { return Json{{"nameServers", nameServers}, {"searchDomains", searchDomains}}; }

DnsRecord DnsRecord::FromJson(const JsonReader& in) {
    DnsRecord dns;
    if (!in.IsPresent()) return dns;
    for (const JsonReader& element : in.Array("nameServers")) {
        std::string text = element.AsString();
        std::string server;
        try {
            server = Gantry::Network::IpAddress(text).GetStringAddress();
        } catch (const std::exception&) {
            element.Fail("expected an IP address");
        }
        if (std::find(dns.nameServers.begin(), dns.nameServers.end(), server) != dns.nameServers.end())
            element.Fail("duplicate name server " + server);
        dns.nameServers.push_back(server);
    }
    for (const JsonReader& element : in.Array("searchDomains")) {
        std::string domain = element.AsString();
        if (domain.empty() || domain.find_first_of(" \t") != std::string::npos)
            element.Fail("expected a domain name without blanks");
        if (dns.HasDomain(domain)) element.Fail("duplicate search domain " + domain);
        dns.searchDomains.push_back(domain);
    }
    in.RejectUnknownMembers();
    return dns;
}

Json SocketRecord::ToJson() const {
    return Json{{"protocol", kSocketProtocolWords[protocol]},
                {"recvQueue", recvQueue},
                {"sendQueue", sendQueue},
                {"localAddress", localAddress},
                {"localPort", localPort},
                {"foreignAddress", foreignAddress},
                {"foreignPort", foreignPort},
                {"state", state},
                {"worldId", worldId},
                {"congestionControl", congestionControl}};
}

SocketRecord SocketRecord::FromJson(const JsonReader& in) {
    SocketRecord socket;
    socket.protocol = WordIndex(in, "protocol", kSocketProtocolWords);
    socket.recvQueue = static_cast<int>(in.Int("recvQueue", 0, 1 << 30));
    socket.sendQueue = static_cast<int>(in.Int("sendQueue", 0, 1 << 30));
    socket.localAddress = in.String("localAddress");
    socket.localPort = static_cast<int>(in.Int("localPort", 0, 65535));
    socket.foreignAddress = in.String("foreignAddress");
    socket.foreignPort = static_cast<int>(in.Int("foreignPort", 0, 65535));
    for (const char* key : {"localAddress", "foreignAddress"})
        if (!Gantry::Network::Ipv4Address::IsValidAddress(in.String(key)) &&
            !Gantry::Network::Ipv6Address::IsValidAddress(in.String(key)))
            in.Member(key).Fail("expected an IP address");
    socket.state = static_cast<int>(in.Int("state", 0, 255));
    socket.worldId = in.Int("worldId", 0, 0xFFFFFFFFll);
    socket.congestionControl = in.String("congestionControl", "");
    in.RejectUnknownMembers();
    return socket;
}

Json RoutingRecord::ToJson() const {
    Json routing = Json::object();
    if (!ipv4Gateway.empty()) {
        routing["ipv4Gateway"] = ipv4Gateway;
        routing["ipv4GatewaySource"] = kGatewaySourceWords[ipv4GatewaySource];
    }
    if (!ipv6Gateway.empty()) routing["ipv6Gateway"] = ipv6Gateway;
    routing["ipv4Routes"] = RoutesJson(ipv4Routes);
    routing["ipv6Routes"] = RoutesJson(ipv6Routes);
    routing["ipv4Neighbors"] = NeighborsJson(ipv4Neighbors, false);
    routing["ipv6Neighbors"] = NeighborsJson(ipv6Neighbors, true);
    return routing;
}

RoutingRecord RoutingRecord::FromJson(const JsonReader& in) {
    RoutingRecord routing;
    if (!in.IsPresent()) return routing;
    if (in.Member("ipv4Gateway").IsPresent()) {
        routing.ipv4Gateway = Address(in, "ipv4Gateway", false);
        if (in.Member("ipv4GatewaySource").IsPresent())
            routing.ipv4GatewaySource = WordIndex(in, "ipv4GatewaySource", kGatewaySourceWords);
    }
    if (in.Member("ipv6Gateway").IsPresent()) routing.ipv6Gateway = Address(in, "ipv6Gateway", true);
    routing.ipv4Routes = Routes(in, "ipv4Routes", false);
    routing.ipv6Routes = Routes(in, "ipv6Routes", true);
    routing.ipv4Neighbors = Neighbors(in, "ipv4Neighbors", false);
    routing.ipv6Neighbors = Neighbors(in, "ipv6Neighbors", true);
    in.RejectUnknownMembers();
    return routing;
}

namespace {
Json SocketsJson(const std::vector<SocketRecord>& sockets) {
    Json list = Json::array();
    for (const SocketRecord& socket : sockets) list.push_back(socket.ToJson());
    return list;
}
}  // namespace

Json NetstackRecord::ToJson() const {
    return Json{{"key", name},
                {"name", displayName},
                {"inKernel", inKernel},
                {"maxConnections", maxConnections},
                {"currentMaxConnections", currentMaxConnections},
                {"congestionControl", congestionControl},
                {"ipv6Enabled", ipv6Enabled},
                {"currentIpv6Enabled", currentIpv6Enabled},
                {"routing", routing.ToJson()},
                {"dns", dns.ToJson()},
                {"connections", SocketsJson(connections)}};
}

// The values in force may be left out: they are then those configured.
NetstackRecord NetstackRecord::FromJson(const JsonReader& in) {
    NetstackRecord record;
    record.name = in.String("key");
    if (record.name.empty()) in.Member("key").Fail("expected the netstack's key");
    record.displayName = in.String("name", record.name);
    record.inKernel = in.Bool("inKernel");
    record.maxConnections = static_cast<int>(in.Int("maxConnections", 1, kMaxConnections));
    record.currentMaxConnections = in.Member("currentMaxConnections").IsPresent()
                                       ? static_cast<int>(in.Int("currentMaxConnections", 1, kMaxConnections))
                                       : record.maxConnections;
    record.congestionControl = in.String("congestionControl");
    if (record.congestionControl.empty()) in.Member("congestionControl").Fail("expected an algorithm's name");
    record.ipv6Enabled = in.Bool("ipv6Enabled");
    record.currentIpv6Enabled =
        in.Member("currentIpv6Enabled").IsPresent() ? in.Bool("currentIpv6Enabled") : record.ipv6Enabled;
    record.routing = RoutingRecord::FromJson(in.Member("routing"));
    record.dns = DnsRecord::FromJson(in.Member("dns"));
    for (const JsonReader& element : in.Array("connections")) record.connections.push_back(SocketRecord::FromJson(element));
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
