#include "FirewallRulesetAllowedipAdd.h"

#include "CommandSupport.h"
#include "FirewallAllowedIpChange.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallRulesetAllowedipAdd::FirewallRulesetAllowedipAdd() {
    SetDescription("Add allowed ip address/range to the ruleset ruleset.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> FirewallRulesetAllowedipAdd::GetInputSpecInternal() {
    return InputSpecOf(kAllowedIpRulesetId, kAllowedIpAddress);
}

boost::shared_ptr<OutputSpec> FirewallRulesetAllowedipAdd::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void FirewallRulesetAllowedipAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    ChangeAllowedIps(systemInfo, input, output, &Gantry::System::FirewallRuleset::AddAllowedIp);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
