#include "FirewallRulesetSet.h"

#include "CommandSupport.h"
#include "gantry/system/FirewallRuleset.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kRulesetId = Parameter::String("ruleset-id", "r", "The label of the ruleset.").Required();
const Parameter kAllowedAll =
    Parameter::Bool("allowed-all", "a", "Set to true to allowed all ip, set to false to use allowed ip list.");
const Parameter kEnabled =
    Parameter::Bool("enabled", "e", "Set to true to enable ruleset, set to false to disable it.");

}  // namespace

FirewallRulesetSet::FirewallRulesetSet() {
    SetDescription("Set firewall ruleset status (allowedAll flag and enabled status).");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> FirewallRulesetSet::GetInputSpecInternal() {
    return InputSpecOf(kRulesetId, kAllowedAll, kEnabled);
}

boost::shared_ptr<OutputSpec> FirewallRulesetSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void FirewallRulesetSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    try {
        std::string rulesetId = input->GetString(kRulesetId);
        if (!input->HasParameter(kEnabled) && !input->HasParameter(kAllowedAll)) {
            output->SetError("Need parameter --enabled or --allowed-all");
            return;
        }
        std::unique_ptr<Gantry::System::FirewallRuleset> ruleset(systemInfo.GetFirewallRulesetById(rulesetId));
        if (!ruleset->IsLoaded()) {
            output->SetError("Invalid Ruleset Id.");
            return;
        }
        bool enabled = ruleset->IsEnabled();
        bool allowedAll = ruleset->IsAllowedAll();
        // A repeated --allowed-all fails, whichever its value; a repeated --enabled passes.
        if (input->HasParameter(kAllowedAll)) {
            bool newAllowedAll = input->GetBool(kAllowedAll);
            if (newAllowedAll == allowedAll) {
                output->SetError("Already allowed all ip");
                return;
            }
            ruleset->SetAllowedAll(newAllowedAll);
        }
        if (input->HasParameter(kEnabled) && input->GetBool(kEnabled) != enabled) {
            if (enabled) {
                ruleset->Disable();
            } else {
                ruleset->Enable();
            }
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
