#pragma once

// The firewall's state on the host: the global switches (one record), the
// configured rulesets, and the dynamic rules added at run time.

#include <string>
#include <utility>
#include <vector>

#include "trellis/host/JsonReader.h"

namespace Trellis {
namespace Host {

// Each enum's values are the indexes of its words, which are how the value
// reads in a host description.
enum class FirewallAction { Drop, Pass };
inline constexpr const char* kFirewallActionWords[] = {"DROP", "PASS"};

enum class FirewallPortType { Dst, Src };
inline constexpr const char* kFirewallPortTypeWords[] = {"dst", "src"};

enum class FirewallDirection { Inbound, Outbound };
inline constexpr const char* kFirewallDirectionWords[] = {"inbound", "outbound"};

enum class FirewallProtocol { Tcp, Udp };
inline constexpr const char* kFirewallProtocolWords[] = {"tcp", "udp"};

// One port rule, of a ruleset or dynamic. Ports run from 0 to 65535 and
// portBegin <= portEnd.
struct FirewallPortRule {
    std::string name;
    FirewallPortType portType = FirewallPortType::Dst;
    int portBegin = 0;
    int portEnd = 0;
    FirewallDirection direction = FirewallDirection::Inbound;
    FirewallProtocol protocol = FirewallProtocol::Tcp;

    Json ToJson() const;
    static FirewallPortRule FromJson(const JsonReader& in);
};

// The addresses a ruleset admits when it does not admit all. Each entry is
// kept in canonical text ("192.0.2.1", "198.51.100.0/24", "2001:db8::1",
// "2001:db8::/32"; a network without host bits) and stands at most once in
// its list.
struct FirewallAllowedIps {
    std::vector<std::string> ipv4Addresses;
    std::vector<std::string> ipv4Networks;
    std::vector<std::string> ipv6Addresses;
    std::vector<std::string> ipv6Networks;

    Json ToJson() const;
    static FirewallAllowedIps FromJson(const JsonReader& in);
};

// The firewall's global state; there is one such record, named kName.
struct FirewallStateRecord {
    static constexpr const char* kKind = "firewall";
    static constexpr const char* kName = "firewall";

    std::string name = kName;
    bool enabled = false;
    FirewallAction defaultAction = FirewallAction::Pass;
    // Whether the rulesets are loaded into the module's filters: false after
    // the filters were destroyed, until the rulesets are loaded again.
    bool rulesetsLoaded = false;

    Json ToJson() const;  // without the name
    static FirewallStateRecord FromJson(const JsonReader& in);
};

// A configured ruleset, named by its label ("sshServer").
struct FirewallRulesetRecord {
    static constexpr const char* kKind = "firewall.ruleset";

    std::string name;
    bool enabled = false;
    bool allowedAll = true;
    std::vector<FirewallPortRule> rules;
    FirewallAllowedIps allowedIps;

    Json ToJson() const;
    static FirewallRulesetRecord FromJson(const JsonReader& in);
};

// A rule added at run time, not through the ruleset configuration; named by
// its rule's name, so adding a rule of a name in use replaces that rule.
// Loading the rulesets drops them all.
struct FirewallDynamicRuleRecord {
    static constexpr const char* kKind = "firewall.dynamicRule";

    std::string name;  // == rule.name
    FirewallPortRule rule;

    explicit FirewallDynamicRuleRecord(FirewallPortRule r = {}) : name(r.name), rule(std::move(r)) {}
    Json ToJson() const;  // the rule
    static FirewallDynamicRuleRecord FromJson(const JsonReader& in);
};

}  // namespace Host
}  // namespace Trellis
