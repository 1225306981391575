#pragma once

#include <string>
#include <vector>

#include "gantry/system/FirewallAllowedIpList.h"
#include "gantry/system/FirewallRule.h"
#include "gantry/system/FirewallRuleset.h"

namespace Trellis {
namespace System {

// A ruleset of the simulated host's firewall. Its getters answer from the
// snapshot that the lookup took; its changing operations re-read and write
// the ruleset's stored configuration in one host operation each (refused
// when the ruleset is no longer present in the firewall), then bring the
// snapshot up to date.
class FirewallRulesetImpl : public virtual Gantry::System::FirewallRuleset {
public:
    // What a lookup found under a label. An absent ruleset has only its name.
    struct Snapshot {
        std::string name;
        bool loaded = false;
        bool enabled = false;
        bool allowedAll = true;
        std::vector<Gantry::System::FirewallRule> rules;
        Gantry::System::FirewallAllowedIpList allowedIps;
    };

    explicit FirewallRulesetImpl(Snapshot snapshot);
    ~FirewallRulesetImpl() override;

    std::string GetName() override;
    bool IsEnabled() override;
    void Enable() override;
    void Disable() override;
    std::vector<Gantry::System::FirewallRule*> GetRules() override;
    bool IsLoaded() override;
    bool IsAllowedAll() override;
    void SetAllowedAll(bool allowedAll) override;
    Gantry::System::FirewallAllowedIpList* GetAllowedIpList() override;
    // Refuses text that is no address or network ("Invalid IP address or
    // network: 300.1.1.1") and an entry already on the list.
    void AddAllowedIp(std::string const& ip) override;
    // Refuses text that is no address or network and an entry not on the list.
    void RemoveAllowedIp(std::string const& ip) override;

private:
    Snapshot snapshot_;
};

}  // namespace System
}  // namespace Trellis
