#include "FirewallRulesetAllowedipRemove.h"

#include "CommandSupport.h"
#include "FirewallAllowedIpChange.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallRulesetAllowedipRemove::FirewallRulesetAllowedipRemove() {
    SetDescription("Remove allowed ip address/range from the ruleset.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> FirewallRulesetAllowedipRemove::GetInputSpecInternal() {
    return InputSpecOf(kAllowedIpRulesetId, kAllowedIpAddress);
}

boost::shared_ptr<OutputSpec> FirewallRulesetAllowedipRemove::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void FirewallRulesetAllowedipRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    ChangeAllowedIps(systemInfo, input, output, &Gantry::System::FirewallRuleset::RemoveAllowedIp);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
