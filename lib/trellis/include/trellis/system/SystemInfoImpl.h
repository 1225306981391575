#pragma once

#include <string>
#include <vector>

#include "gantry/system/FirewallRule.h"
#include "gantry/system/FirewallRuleset.h"

namespace Trellis {
namespace System {

// The facade to the host's system state: the firewall of the packet filter
// module "haldenfw", its rulesets and its dynamic rules. It keeps nothing:
// every operation asks the host anew.
//
// While the module is not loaded it keeps its configuration, but the
// firewall's own state cannot be read or changed: those operations throw
// GantryException ("The firewall module haldenfw is not loaded"). A ruleset is
// present in the firewall only while the module is loaded and the rulesets
// are loaded into its filters; otherwise there are none.
class SystemInfoImpl {
public:
    SystemInfoImpl();
    ~SystemInfoImpl();
    SystemInfoImpl(const SystemInfoImpl&) = delete;
    SystemInfoImpl& operator=(const SystemInfoImpl&) = delete;

    // The global switch.
    bool IsFirewallEnabled();
    void SetFirewallEnabled(bool enabled);
    // For a packet that matches no rule: true is PASS, false is DROP.
    bool GetFirewallDefaultAction();
    void SetFirewallDefaultAction(bool pass);

    // Loads the rulesets from their stored configuration into the module's
    // filters; the dynamic rules are dropped.
    void LoadFirewallRulesets();
    // The rules added at run time; the caller owns the elements. None while
    // the filters are destroyed.
    std::vector<Gantry::System::FirewallRule*> GetFirewallDynamicRules();
    // Adds one, replacing a dynamic rule of the same name. Refused while the
    // filters are destroyed, and for ports outside 0..65535 or a range that
    // ends before it begins.
    void AddFirewallDynamicRule(Gantry::System::FirewallRule& rule);
    // Removes the module's filters (the loaded rulesets and the dynamic
    // rules), after which the module can be unloaded. The configuration stays.
    void DestroyFirewallFilters();

    // The rulesets present in the firewall, in their configured order; the
    // caller owns the elements.
    std::vector<Gantry::System::FirewallRuleset*> GetFirewallRulesets();
    // An object for any label, owned by the caller; its IsLoaded tells whether
    // that ruleset is present in the firewall.
    Gantry::System::FirewallRuleset* GetFirewallRulesetById(std::string const& id);
};

}  // namespace System
}  // namespace Trellis
