#include "system/FirewallHost.h"

#include <optional>

#include "gantry/lib/GantryException.h"
#include "trellis/host/records/ModuleRecord.h"

namespace Trellis {
namespace System {

using Gantry::System::FirewallRule;
using Host::FirewallDirection;
using Host::FirewallPortType;
using Host::FirewallProtocol;

bool IsFirewallModuleLoaded(const Host::Transaction& t) {
    std::optional<Host::ModuleRecord> module = t.Find<Host::ModuleRecord>(kFirewallModule);
    return module && module->loaded;
}

void RequireFirewallModule(const Host::Transaction& t) {
    if (!IsFirewallModuleLoaded(t))
        throw Gantry::Lib::GantryException(std::string("The firewall module ") + kFirewallModule + " is not loaded");
}

Host::FirewallStateRecord FirewallState(const Host::Transaction& t) {
    return t.Find<Host::FirewallStateRecord>(Host::FirewallStateRecord::kName).value_or(Host::FirewallStateRecord());
}

void ClearFirewallFilters(Host::Transaction& t) {
    Host::FirewallStateRecord state = FirewallState(t);
    state.rulesetsLoaded = false;
    t.Put(state);
    t.EraseAll<Host::FirewallDynamicRuleRecord>();
}

bool AreRulesetsPresent(const Host::Transaction& t) {
    return IsFirewallModuleLoaded(t) && FirewallState(t).rulesetsLoaded;
}

Host::FirewallRulesetRecord RequirePresentRuleset(const Host::Transaction& t, const std::string& name) {
    std::optional<Host::FirewallRulesetRecord> ruleset;
    if (AreRulesetsPresent(t)) ruleset = t.Find<Host::FirewallRulesetRecord>(name);
    if (!ruleset) throw Gantry::Lib::GantryException("The ruleset " + name + " is not present in the firewall");
    return *ruleset;
}

FirewallRule ToGantryRule(const Host::FirewallPortRule& rule) {
    FirewallRule result;
    result.name = rule.name;
    result.portType =
        rule.portType == FirewallPortType::Dst ? FirewallRule::PORT_TYPE_DST : FirewallRule::PORT_TYPE_SRC;
    result.portBegin = rule.portBegin;
    result.portEnd = rule.portEnd;
    result.direction = rule.direction == FirewallDirection::Inbound ? FirewallRule::DIRECTION_INBOUND
                                                                    : FirewallRule::DIRECTION_OUTBOUND;
    result.protocol = rule.protocol == FirewallProtocol::Tcp ? FirewallRule::PROTOCOL_TCP : FirewallRule::PROTOCOL_UDP;
    return result;
}

Host::FirewallPortRule ToPortRule(const FirewallRule& rule) {
    Host::FirewallPortRule result;
    result.name = rule.name;
    result.portType = rule.portType == FirewallRule::PORT_TYPE_DST ? FirewallPortType::Dst : FirewallPortType::Src;
    result.portBegin = rule.portBegin;
    result.portEnd = rule.portEnd;
    result.direction =
        rule.direction == FirewallRule::DIRECTION_INBOUND ? FirewallDirection::Inbound : FirewallDirection::Outbound;
    result.protocol = rule.protocol == FirewallRule::PROTOCOL_TCP ? FirewallProtocol::Tcp : FirewallProtocol::Udp;
    return result;
}

Gantry::System::FirewallAllowedIpList ToGantryAllowedIps(const Host::FirewallAllowedIps& ips) {
    Gantry::System::FirewallAllowedIpList list;
    for (const std::string& text : ips.ipv4Addresses) list.ipv4Addresses.emplace_back(text);
    for (const std::string& text : ips.ipv4Networks) list.ipv4Networks.emplace_back(text);
    for (const std::string& text : ips.ipv6Addresses) list.ipv6Addresses.emplace_back(text);
    for (const std::string& text : ips.ipv6Networks) list.ipv6Networks.emplace_back(text);
    return list;
}

FirewallRulesetImpl::Snapshot ToSnapshot(const Host::FirewallRulesetRecord& record) {
    FirewallRulesetImpl::Snapshot snapshot;
    snapshot.name = record.name;
    snapshot.loaded = true;
    snapshot.enabled = record.enabled;
    snapshot.allowedAll = record.allowedAll;
    for (const Host::FirewallPortRule& rule : record.rules) snapshot.rules.push_back(ToGantryRule(rule));
    snapshot.allowedIps = ToGantryAllowedIps(record.allowedIps);
    return snapshot;
}

}  // namespace System
}  // namespace Trellis
