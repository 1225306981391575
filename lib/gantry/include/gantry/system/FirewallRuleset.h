#pragma once

#include <string>
#include <vector>

#include "gantry/lib/GantryObject.h"
#include "gantry/system/FirewallAllowedIpList.h"
#include "gantry/system/FirewallRule.h"

namespace Gantry {
namespace System {

// One named ruleset of the host firewall ("sshServer"), as a lookup found
// it. The getters answer from that moment; the changing operations work on
// the ruleset's stored configuration, so a change survives the next load of
// the rulesets. Every operation throws Gantry::Lib::GantryException when the
// host refuses it.
class FirewallRuleset : public virtual Lib::GantryObject {
public:
    ~FirewallRuleset() override;

    virtual std::string GetName() = 0;
    virtual bool IsEnabled() = 0;
    virtual void Enable() = 0;
    virtual void Disable() = 0;
    // The port rules; the caller owns the elements.
    virtual std::vector<FirewallRule*> GetRules() = 0;
    // Whether the ruleset is present in the firewall: false for an unknown
    // label, and for every label while the rulesets are not loaded into the
    // packet filter.
    virtual bool IsLoaded() = 0;
    // Whether all source addresses are admitted; if not, only the allowed list.
    virtual bool IsAllowedAll() = 0;
    virtual void SetAllowedAll(bool allowedAll) = 0;
    // The caller owns the list.
    virtual FirewallAllowedIpList* GetAllowedIpList() = 0;
    // An IPv4 or IPv6 address, or an "address/prefix" network, in any text
    // form the address types accept; stored in canonical form. Refuses other
    // text and an entry that is already on the list.
    virtual void AddAllowedIp(std::string const& ip) = 0;
    // Removes the entry of that canonical form; refuses one not on the list.
    virtual void RemoveAllowedIp(std::string const& ip) = 0;
};

}  // namespace System
}  // namespace Gantry
