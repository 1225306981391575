#include "trellis/host/records/TslNicRecord.h"

#include <algorithm>
#include <limits>

#include <nlohmann/json.hpp>

#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv6Network.h"
#include "gantry/network/MacAddress.h"
#include "trellis/network/TslNicTags.h"

namespace Trellis {
namespace Host {

namespace {

std::string RequiredText(const JsonReader& in, const char* key, const char* what) {
    std::string text = in.String(key);
    if (text.empty()) in.Member(key).Fail(std::string("expected ") + what);
    return text;
}

std::string Ipv4Text(const JsonReader& in, const char* key) {
    std::string text = in.String(key);
    if (!Gantry::Network::Ipv4Address::IsValidAddress(text)) in.Member(key).Fail("expected an IPv4 address");
    return Gantry::Network::Ipv4Address(text).GetStringAddress();
}

}  // namespace

int TslNicRecord::NumberOf(std::string const& name) {
    if (name.size() < 4 || name.size() > 6 || name.compare(0, 3, "tsl") != 0) return -1;
    const std::string digits = name.substr(3);
    if (digits.find_first_not_of("0123456789") != std::string::npos || (digits.size() > 1 && digits[0] == '0'))
        return -1;
    int number = std::stoi(digits);
    return number <= kMaxNumber ? number : -1;
}

Json ConnectionRecord::ToJson() const {
    switch (kind) {
        case ConnectionKind::PortGroup:
            return Json{{"portGroup", portGroup}};
        case ConnectionKind::DVPort:
            return Json{{"dvSwitch", dvSwitch}, {"dvPort", dvPort}, {"connectionId", connectionId}};
        case ConnectionKind::OpaqueNetwork:
            return Json{{"opaqueNetwork",
                         Json{{"networkId", networkId}, {"networkType", networkType}, {"externalId", externalId}}}};
        case ConnectionKind::None:
            break;
    }
    return nullptr;
}

ConnectionRecord ConnectionRecord::FromJson(const JsonReader& in) {
    ConnectionRecord point;
    if (!in.IsPresent()) return point;
    if (in.Member("portGroup").IsPresent()) {
        point.kind = ConnectionKind::PortGroup;
        point.portGroup = RequiredText(in, "portGroup", "a port group name");
    } else if (in.Member("dvSwitch").IsPresent()) {
        point.kind = ConnectionKind::DVPort;
        point.dvSwitch = RequiredText(in, "dvSwitch", "a distributed switch name");
        point.dvPort = RequiredText(in, "dvPort", "a DVPort id");
        point.connectionId = static_cast<std::uint32_t>(
            in.Member("connectionId").IsPresent() ? in.Int("connectionId", 0, std::numeric_limits<std::uint32_t>::max())
                                                  : 0);
    } else if (in.Member("opaqueNetwork").IsPresent()) {
        point.kind = ConnectionKind::OpaqueNetwork;
        JsonReader network = in.Object("opaqueNetwork");
        point.networkId = RequiredText(network, "networkId", "the network's id");
        point.networkType = network.String("networkType");
        point.externalId = network.String("externalId");
        network.RejectUnknownMembers();
    } else {
        in.Fail("expected \"portGroup\", \"dvSwitch\" with \"dvPort\", or \"opaqueNetwork\"");
    }
    in.RejectUnknownMembers();
    return point;
}

Json TslNicRecord::ToJson() const {
    Json nic{{"name", name},
             {"macAddress", macAddress},
             {"mtu", mtu},
             {"tsoMss", tsoMss},
             {"enabled", enabled},
             {"netstack", netstack}};
    if (connection.kind != ConnectionKind::None) nic["connectionPoint"] = connection.ToJson();
    Json ipv4{{"mode", WordOf(ipv4Mode, kIpv4ModeWords)}};
    if (ipv4Mode == Ipv4Mode::Static) {
        ipv4["address"] = ipv4Address;
        ipv4["netmask"] = ipv4Netmask;
    }
    ipv4["dhcpDns"] = dhcpDns;
    nic["ipv4"] = ipv4;
    Json addresses = Json::array();
    for (const Ipv6AddressRecord& address : ipv6Addresses)
        addresses.push_back(Json{{"address", address.network}, {"status", kIpv6StatusWords[address.status - 2]}});
    nic["ipv6"] = Json{{"dhcp", ipv6Dhcp}, {"routerAdvertised", ipv6RouterAdvertised}, {"addresses", addresses}};
    Json tagNames = Json::array();
    for (int tag : tags)
        tagNames.push_back(Trellis::Network::TslNicTagIdToName(static_cast<Gantry::Network::TslNicTagType>(tag)));
    nic["tags"] = tagNames;
    return nic;
}

TslNicRecord TslNicRecord::FromJson(const JsonReader& in) {
    TslNicRecord record;
    record.name = in.String("name");
    if (NumberOf(record.name) < 0) in.Member("name").Fail("expected tsl0 to tsl255");
    std::string mac = in.String("macAddress");
    if (!Gantry::Network::MacAddress::IsValid(mac)) in.Member("macAddress").Fail("expected a unicast MAC address");
    record.macAddress = Gantry::Network::MacAddress(mac).GetStringAddress();
    record.mtu = static_cast<int>(in.Int("mtu", 1280, 9000));
    record.tsoMss = static_cast<int>(in.Int("tsoMss", 1, 65535));
    record.enabled = in.Bool("enabled");
    record.netstack = RequiredText(in, "netstack", "a netstack key");
    record.connection = ConnectionRecord::FromJson(in.Member("connectionPoint"));

    JsonReader ipv4 = in.Object("ipv4");
    record.ipv4Mode = ipv4.Word<Ipv4Mode>("mode", kIpv4ModeWords);
    if (record.ipv4Mode == Ipv4Mode::Static) {
        record.ipv4Address = Ipv4Text(ipv4, "address");
        record.ipv4Netmask = Ipv4Text(ipv4, "netmask");
    }
    record.dhcpDns = ipv4.Bool("dhcpDns");
    ipv4.RejectUnknownMembers();

    JsonReader ipv6 = in.Object("ipv6");
    record.ipv6Dhcp = ipv6.Bool("dhcp");
    record.ipv6RouterAdvertised = ipv6.Bool("routerAdvertised");
    for (const JsonReader& element : ipv6.Array("addresses")) {
        Ipv6AddressRecord address;
        address.network = element.String("address");
        if (!Gantry::Network::Ipv6Network::IsValidAddressAndNetmask(address.network))
            element.Member("address").Fail("expected an IPv6 address with its prefix length");
        address.network = Gantry::Network::Ipv6Network(address.network).GetStringAddress();
        address.status = 2 + static_cast<int>(element.Word("status", kIpv6StatusWords, 4));
        element.RejectUnknownMembers();
        record.ipv6Addresses.push_back(address);
    }
    ipv6.RejectUnknownMembers();

    for (const JsonReader& element : in.Array("tags")) {
        auto tag = Trellis::Network::TslNicTagNameToId(element.AsString());
        if (tag == Gantry::Network::TSLNIC_TAG_INVALID) element.Fail("expected a tag name");
        if (std::find(record.tags.begin(), record.tags.end(), tag) == record.tags.end()) record.tags.push_back(tag);
    }
    in.RejectUnknownMembers();
    return record;
}

}  // namespace Host
}  // namespace Trellis
