#include "FirewallRulesetAllowedipRemove.h"

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

FirewallRulesetAllowedipRemove::FirewallRulesetAllowedipRemove() {
    SetDescription("Remove allowed ip address/range from the ruleset.");
    SetMetaDataField("type", "operation");
}

FirewallRulesetAllowedipRemove::~FirewallRulesetAllowedipRemove() {}

boost::shared_ptr<FirewallRulesetAllowedipRemove> FirewallRulesetAllowedipRemove::New() {
    return boost::shared_ptr<FirewallRulesetAllowedipRemove>(new FirewallRulesetAllowedipRemove());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallRulesetAllowedipRemove::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> rulesetId =
        Plinth::CallSpec::ParameterSpec::New("ruleset-id", Plinth::CallSpec::PARAMETER_STRING);
    rulesetId->SetRequired(true);
    rulesetId->SetShortName("r");
    rulesetId->SetDescription("The label of the ruleset.");
    inputSpec->AddParameter(rulesetId);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> ipAddress =
        Plinth::CallSpec::ParameterSpec::New("ip-address", Plinth::CallSpec::PARAMETER_STRING);
    ipAddress->SetRequired(true);
    ipAddress->SetShortName("i");
    ipAddress->SetDescription("Allowed ip address/range for the ruleset.");
    inputSpec->AddParameter(ipAddress);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallRulesetAllowedipRemove::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void FirewallRulesetAllowedipRemove::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                                     boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    Gantry::System::FirewallRuleset* ruleset = nullptr;
    try {
        std::string rulesetId = input->GetString("ruleset-id");
        std::string ipAddress = input->GetString("ip-address");
        ruleset = systemInfo.GetFirewallRulesetById(rulesetId);
        if (!ruleset->IsLoaded()) {
            output->SetError("Invalid Ruleset Id.");
            delete ruleset;
            return;
        }
        if (ruleset->IsAllowedAll()) {
            output->SetError("Couldn't update allowed ip list when allowed-all flag is true.");
            delete ruleset;
            return;
        }
        // An empty address is reported, and the call still delivers true.
        if (ipAddress.empty()) {
            output->SetError("Invalid allowedip parameter.");
        } else {
            ruleset->RemoveAllowedIp(ipAddress);
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
