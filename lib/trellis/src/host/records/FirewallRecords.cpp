#include "trellis/host/records/FirewallRecords.h"

#include <algorithm>
#include <optional>

#include <nlohmann/json.hpp>

#include "host/records/AllowedIpText.h"

namespace Trellis {
namespace Host {

namespace {

// An entry is taken only in its canonical form, so that the stored text is
// the one that AddAllowedIp would store and RemoveAllowedIp finds.
std::vector<std::string> ReadAddressList(const JsonReader& in, const char* key, AllowedIpKind kind,
                                         const char* expected) {
    std::vector<std::string> list;
    for (const JsonReader& element : in.Array(key)) {
        std::string text = element.AsString();
        std::optional<AllowedIp> entry = ParseAllowedIp(text);
        if (!entry || entry->kind != kind || entry->text != text) element.Fail(std::string("expected ") + expected);
        if (std::find(list.begin(), list.end(), text) != list.end()) element.Fail("duplicate entry \"" + text + "\"");
        list.push_back(text);
    }
    return list;
}

std::string RequireName(const JsonReader& in, const char* what) {
    std::string name = in.String("name");
    if (name.empty()) in.Member("name").Fail(std::string("expected ") + what);
    return name;
}

}  // namespace

Json FirewallPortRule::ToJson() const {
    return Json{{"name", name},
                {"portType", WordOf(portType, kFirewallPortTypeWords)},
                {"portBegin", portBegin},
                {"portEnd", portEnd},
                {"direction", WordOf(direction, kFirewallDirectionWords)},
                {"protocol", WordOf(protocol, kFirewallProtocolWords)}};
}

FirewallPortRule FirewallPortRule::FromJson(const JsonReader& in) {
    FirewallPortRule rule;
    rule.name = in.String("name");
    rule.portType = in.Word<FirewallPortType>("portType", kFirewallPortTypeWords);
    rule.portBegin = static_cast<int>(in.Int("portBegin", 0, 65535));
    rule.portEnd = static_cast<int>(in.Int("portEnd", 0, 65535));
    if (rule.portEnd < rule.portBegin)
        in.Member("portEnd").Fail("expected a port not below portBegin (" + std::to_string(rule.portBegin) + ")");
    rule.direction = in.Word<FirewallDirection>("direction", kFirewallDirectionWords);
    rule.protocol = in.Word<FirewallProtocol>("protocol", kFirewallProtocolWords);
    in.RejectUnknownMembers();
    return rule;
}

Json FirewallAllowedIps::ToJson() const {
    return Json{{"ipv4Addresses", ipv4Addresses},
                {"ipv4Networks", ipv4Networks},
                {"ipv6Addresses", ipv6Addresses},
                {"ipv6Networks", ipv6Networks}};
}

FirewallAllowedIps FirewallAllowedIps::FromJson(const JsonReader& in) {
    FirewallAllowedIps ips;
    if (!in.IsPresent()) return ips;
    ips.ipv4Addresses = ReadAddressList(in, "ipv4Addresses", AllowedIpKind::Ipv4Address,
                                        "an IPv4 address in canonical form, such as \"192.0.2.1\"");
    ips.ipv4Networks = ReadAddressList(in, "ipv4Networks", AllowedIpKind::Ipv4Network,
                                       "an IPv4 network in canonical form, such as \"192.0.2.0/24\"");
    ips.ipv6Addresses = ReadAddressList(in, "ipv6Addresses", AllowedIpKind::Ipv6Address,
                                        "an IPv6 address in canonical form, such as \"2001:db8::1\"");
    ips.ipv6Networks = ReadAddressList(in, "ipv6Networks", AllowedIpKind::Ipv6Network,
                                       "an IPv6 network in canonical form, such as \"2001:db8::/32\"");
    in.RejectUnknownMembers();
    return ips;
}

Json FirewallStateRecord::ToJson() const {
    return Json{{"enabled", enabled},
                {"defaultAction", WordOf(defaultAction, kFirewallActionWords)},
                {"rulesetsLoaded", rulesetsLoaded}};
}

FirewallStateRecord FirewallStateRecord::FromJson(const JsonReader& in) {
    FirewallStateRecord record;
    record.enabled = in.Bool("enabled");
    record.defaultAction = in.Word<FirewallAction>("defaultAction", kFirewallActionWords);
    record.rulesetsLoaded = in.Bool("rulesetsLoaded");
    in.RejectUnknownMembers();
    return record;
}

Json FirewallRulesetRecord::ToJson() const {
    Json json{{"name", name}, {"enabled", enabled}, {"allowedAll", allowedAll}, {"rules", Json::array()}};
    for (const FirewallPortRule& rule : rules) json["rules"].push_back(rule.ToJson());
    json["allowedIps"] = allowedIps.ToJson();
    return json;
}

FirewallRulesetRecord FirewallRulesetRecord::FromJson(const JsonReader& in) {
    FirewallRulesetRecord record;
    record.name = RequireName(in, "a ruleset label");
    record.enabled = in.Bool("enabled");
    record.allowedAll = in.Bool("allowedAll");
    for (const JsonReader& rule : in.Array("rules")) record.rules.push_back(FirewallPortRule::FromJson(rule));
    record.allowedIps = FirewallAllowedIps::FromJson(in.Member("allowedIps"));
    in.RejectUnknownMembers();
    return record;
}

Json FirewallDynamicRuleRecord::ToJson() const {
    return rule.ToJson();
}

FirewallDynamicRuleRecord FirewallDynamicRuleRecord::FromJson(const JsonReader& in) {
    return FirewallDynamicRuleRecord(FirewallPortRule::FromJson(in));
}

}  // namespace Host
}  // namespace Trellis
