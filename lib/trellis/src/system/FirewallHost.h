#pragma once

// What the firewall's host objects share: the state of the packet filter
// module as one transaction sees it, and the translation between the stored
// records and the Gantry types.

#include <string>

#include "gantry/system/FirewallAllowedIpList.h"
#include "gantry/system/FirewallRule.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/FirewallRecords.h"
#include "trellis/system/FirewallRulesetImpl.h"

namespace Trellis {
namespace System {

// The kernel module of the packet filter.
inline constexpr const char* kFirewallModule = "haldenfw";

bool IsFirewallModuleLoaded(const Host::Transaction& t);
// Throws GantryException "The firewall module haldenfw is not loaded".
void RequireFirewallModule(const Host::Transaction& t);
// The global state; a host without one has the defaults of a missing section.
Host::FirewallStateRecord FirewallState(const Host::Transaction& t);
// Empties the module's filters: the rulesets are no longer loaded into them
// and the dynamic rules are gone. The configuration stays.
void ClearFirewallFilters(Host::Transaction& t);
// Whether the rulesets are present in the firewall: the module is loaded and
// the rulesets are loaded into its filters.
bool AreRulesetsPresent(const Host::Transaction& t);
// The configuration of a ruleset present in the firewall; throws
// GantryException "The ruleset <name> is not present in the firewall" for
// any other label.
Host::FirewallRulesetRecord RequirePresentRuleset(const Host::Transaction& t, const std::string& name);

Gantry::System::FirewallRule ToGantryRule(const Host::FirewallPortRule& rule);
Host::FirewallPortRule ToPortRule(const Gantry::System::FirewallRule& rule);
Gantry::System::FirewallAllowedIpList ToGantryAllowedIps(const Host::FirewallAllowedIps& ips);
// The snapshot of a ruleset present in the firewall.
FirewallRulesetImpl::Snapshot ToSnapshot(const Host::FirewallRulesetRecord& record);

}  // namespace System
}  // namespace Trellis
