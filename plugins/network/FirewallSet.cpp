#include "FirewallSet.h"

#include "gantry/lib/GantryException.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallSet::FirewallSet() {
    SetDescription("Set firewall enabled status and default action.");
    SetMetaDataField("type", "operation");
}

FirewallSet::~FirewallSet() {}

boost::shared_ptr<FirewallSet> FirewallSet::New() { return boost::shared_ptr<FirewallSet>(new FirewallSet()); }

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallSet::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> enabled =
        Plinth::CallSpec::ParameterSpec::New("enabled", Plinth::CallSpec::PARAMETER_BOOL);
    enabled->SetRequired(false);
    enabled->SetShortName("e");
    enabled->SetDescription("Set to true to enable the firewall, set to false to disable the firewall.");
    inputSpec->AddParameter(enabled);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> defaultAction =
        Plinth::CallSpec::ParameterSpec::New("default-action", Plinth::CallSpec::PARAMETER_BOOL);
    defaultAction->SetRequired(false);
    defaultAction->SetShortName("d");
    defaultAction->SetDescription("Set to true to set defaultaction PASS, set to false to DROP.");
    inputSpec->AddParameter(defaultAction);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallSet::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void FirewallSet::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                  boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    if (!input->HasParameter("enabled") && !input->HasParameter("default-action")) {
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
        if (input->HasParameter("enabled") && input->GetBool("enabled") != enabled) {
            systemInfo.SetFirewallEnabled(!enabled);
        }
        // Unlike --enabled, a default action that is already in force is a failure.
        if (input->HasParameter("default-action")) {
            if (input->GetBool("default-action") == defaultAction) {
                output->SetError(defaultAction ? "Default action already PASS" : "Default action already DROP");
                return;
            }
            systemInfo.SetFirewallDefaultAction(!defaultAction);
        }
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
