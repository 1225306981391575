#include "FirewallRulesetSelection.h"

namespace KorvexCli {
namespace NetworkNamespace {

bool SelectFirewallRulesets(Trellis::System::SystemInfoImpl& systemInfo, boost::shared_ptr<Input> input,
                            Parameter const& rulesetIdParameter, boost::shared_ptr<Output> output,
                            OwnedVector<Gantry::System::FirewallRuleset>& rulesets) {
    if (input->HasParameter(rulesetIdParameter)) {
        std::string rulesetId = input->GetString(rulesetIdParameter);
        try {
            std::unique_ptr<Gantry::System::FirewallRuleset> ruleset(systemInfo.GetFirewallRulesetById(rulesetId));
            if (!ruleset->IsLoaded()) {
                output->SetError("Ruleset Not Found: " + rulesetId);
                return false;
            }
            rulesets.Add(ruleset.release());
        } catch (GantryException&) {
            output->SetError("Failed to check loaded status: " + rulesetId);
            return false;
        }
        return true;
    }
    try {
        rulesets = systemInfo.GetFirewallRulesets();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
        return false;
    }
    return true;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
