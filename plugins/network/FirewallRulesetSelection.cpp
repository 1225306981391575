#include "FirewallRulesetSelection.h"

#include <string>

#include "gantry/lib/GantryException.h"

namespace KorvexCli {
namespace NetworkNamespace {

bool SelectFirewallRulesets(Trellis::System::SystemInfoImpl& systemInfo,
                            boost::shared_ptr<Plinth::CallSpec::Input> input,
                            boost::shared_ptr<Plinth::CallSpec::Output> output,
                            std::vector<Gantry::System::FirewallRuleset*>& rulesets) {
    if (input->HasParameter("ruleset-id")) {
        std::string rulesetId = input->GetString("ruleset-id");
        Gantry::System::FirewallRuleset* ruleset = nullptr;
        try {
            ruleset = systemInfo.GetFirewallRulesetById(rulesetId);
            if (!ruleset->IsLoaded()) {
                delete ruleset;
                output->SetError("Ruleset Not Found: " + rulesetId);
                return false;
            }
        } catch (Gantry::Lib::GantryException&) {
            delete ruleset;
            output->SetError("Failed to check loaded status: " + rulesetId);
            return false;
        }
        rulesets.push_back(ruleset);
        return true;
    }
    try {
        rulesets = systemInfo.GetFirewallRulesets();
    } catch (Gantry::Lib::GantryException& e) {
        output->SetError(e.GetMessage(0));
        return false;
    }
    return true;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
