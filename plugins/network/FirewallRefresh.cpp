#include "FirewallRefresh.h"

#include "CommandSupport.h"
#include "gantry/system/FirewallRule.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallRefresh::FirewallRefresh() {
    SetDescription("Load ruleset configuration for firewall.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> FirewallRefresh::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> FirewallRefresh::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void FirewallRefresh::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    try {
        // Loading the rulesets drops the dynamic rules; they are saved and put back.
        OwnedVector<Gantry::System::FirewallRule> dynamicRules(systemInfo.GetFirewallDynamicRules());
        systemInfo.LoadFirewallRulesets();
        for (Gantry::System::FirewallRule* rule : dynamicRules) {
            systemInfo.AddFirewallDynamicRule(*rule);
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
