#include "FirewallSet.h"

#include "CommandSupport.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kEnabled =
    Parameter::Bool("enabled", "e", "Set to true to enable the firewall, set to false to disable the firewall.");
const Parameter kDefaultAction =
    Parameter::Bool("default-action", "d", "Set to true to set defaultaction PASS, set to false to DROP.");

}  // namespace

FirewallSet::FirewallSet() {
    SetDescription("Set firewall enabled status and default action.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> FirewallSet::GetInputSpecInternal() { return InputSpecOf(kEnabled, kDefaultAction); }

boost::shared_ptr<OutputSpec> FirewallSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void FirewallSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    if (!input->HasParameter(kEnabled) && !input->HasParameter(kDefaultAction)) {
        output->SetError("Need parameter --enabled or --default-action");
        return;
    }
    try {
        Trellis::System::ModuleImpl module("haldenfw");
        if (!module.IsLoaded()) {
            output->SetError("Firewall module is not loaded");
            return;
        }
        bool enabled = systemInfo.IsFirewallEnabled();
        bool defaultAction = systemInfo.GetFirewallDefaultAction();
        if (input->HasParameter(kEnabled) && input->GetBool(kEnabled) != enabled) {
            systemInfo.SetFirewallEnabled(!enabled);
        }
        // Unlike --enabled, a default action that is already in force is a failure.
        if (input->HasParameter(kDefaultAction)) {
            if (input->GetBool(kDefaultAction) == defaultAction) {
                output->SetError(defaultAction ? "Default action already PASS" : "Default action already DROP");
                return;
            }
            systemInfo.SetFirewallDefaultAction(!defaultAction);
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
