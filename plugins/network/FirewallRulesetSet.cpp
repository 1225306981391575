#include "FirewallRulesetSet.h"

#include <string>

#include "gantry/lib/GantryException.h"
#include "gantry/system/FirewallRuleset.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallRulesetSet::FirewallRulesetSet() {
    SetDescription("Set firewall ruleset status (allowedAll flag and enabled status).");
    SetMetaDataField("type", "operation");
}

FirewallRulesetSet::~FirewallRulesetSet() {}

boost::shared_ptr<FirewallRulesetSet> FirewallRulesetSet::New() {
    return boost::shared_ptr<FirewallRulesetSet>(new FirewallRulesetSet());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallRulesetSet::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> rulesetId =
        Plinth::CallSpec::ParameterSpec::New("ruleset-id", Plinth::CallSpec::PARAMETER_STRING);
    rulesetId->SetRequired(true);
    rulesetId->SetShortName("r");
    rulesetId->SetDescription("The label of the ruleset.");
    inputSpec->AddParameter(rulesetId);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> allowedAll =
        Plinth::CallSpec::ParameterSpec::New("allowed-all", Plinth::CallSpec::PARAMETER_BOOL);
    allowedAll->SetRequired(false);
    allowedAll->SetShortName("a");
    allowedAll->SetDescription("Set to true to allowed all ip, set to false to use allowed ip list.");
    inputSpec->AddParameter(allowedAll);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> enabled =
        Plinth::CallSpec::ParameterSpec::New("enabled", Plinth::CallSpec::PARAMETER_BOOL);
    enabled->SetRequired(false);
    enabled->SetShortName("e");
    enabled->SetDescription("Set to true to enable ruleset, set to false to disable it.");
    inputSpec->AddParameter(enabled);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallRulesetSet::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void FirewallRulesetSet::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                         boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    Gantry::System::FirewallRuleset* ruleset = nullptr;
    try {
        std::string rulesetId = input->GetString("ruleset-id");
        if (!input->HasParameter("enabled") && !input->HasParameter("allowed-all")) {
            output->SetError("Need parameter --enabled or --allowed-all");
            return;
        }
        ruleset = systemInfo.GetFirewallRulesetById(rulesetId);
        if (!ruleset->IsLoaded()) {
            output->SetError("Invalid Ruleset Id.");
            delete ruleset;
            return;
        }
        bool enabled = ruleset->IsEnabled();
        bool allowedAll = ruleset->IsAllowedAll();
        // A repeated --allowed-all fails, whichever its value; a repeated --enabled passes.
        if (input->HasParameter("allowed-all")) {
            bool newAllowedAll = input->GetBool("allowed-all");
            if (newAllowedAll == allowedAll) {
                output->SetError("Already allowed all ip");
                delete ruleset;
                return;
            }
            ruleset->SetAllowedAll(newAllowedAll);
        }
        if (input->HasParameter("enabled") && input->GetBool("enabled") != enabled) {
            if (enabled) {
                ruleset->Disable();
            } else {
                ruleset->Enable();
            }
        }
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
        delete ruleset;
    } catch (Gantry::Lib::GantryException& e) {
        delete ruleset;
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
