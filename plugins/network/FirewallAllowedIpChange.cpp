#include "FirewallAllowedIpChange.h"

namespace KorvexCli {
namespace NetworkNamespace {

const Parameter kAllowedIpRulesetId = Parameter::String("ruleset-id", "r", "The label of the ruleset.").Required();
const Parameter kAllowedIpAddress =
    Parameter::String("ip-address", "i", "Allowed ip address/range for the ruleset.").Required();

void ChangeAllowedIps(Trellis::System::SystemInfoImpl& systemInfo, boost::shared_ptr<Input> input,
                      boost::shared_ptr<Output> output,
                      void (Gantry::System::FirewallRuleset::*change)(std::string const&)) {
    try {
        std::string rulesetId = input->GetString(kAllowedIpRulesetId);
        std::string ipAddress = input->GetString(kAllowedIpAddress);
        std::unique_ptr<Gantry::System::FirewallRuleset> ruleset(systemInfo.GetFirewallRulesetById(rulesetId));
        if (!ruleset->IsLoaded()) {
            output->SetError("Invalid Ruleset Id.");
            return;
        }
        if (ruleset->IsAllowedAll()) {
            output->SetError("Couldn't update allowed ip list when allowed-all flag is true.");
            return;
        }
        if (ipAddress.empty()) {
            output->SetError("Invalid allowedip parameter.");
        } else {
            ((*ruleset).*change)(ipAddress);
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
