#include "FirewallLoad.h"

#include "CommandSupport.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallLoad::FirewallLoad() {
    SetDescription("Load firewall module and rulesets configuration.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> FirewallLoad::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> FirewallLoad::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void FirewallLoad::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    try {
        // Whatever the module answers for a module that is loaded already stands.
        Trellis::System::ModuleImpl module("haldenfw");
        module.Load("", false);
        systemInfo.LoadFirewallRulesets();
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
