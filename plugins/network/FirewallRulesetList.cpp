#include "FirewallRulesetList.h"

#include <vector>

#include "FirewallRulesetSelection.h"
#include "gantry/lib/GantryException.h"
#include "gantry/system/FirewallRuleset.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"
#include "trellis/system/SystemInfoImpl.h"
#include "util/VectorUtil"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallRulesetList::FirewallRulesetList() {
    SetDescription("List the rulesets in firewall.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:Ruleset", "Name,Enabled");
}

FirewallRulesetList::~FirewallRulesetList() {}

boost::shared_ptr<FirewallRulesetList> FirewallRulesetList::New() {
    return boost::shared_ptr<FirewallRulesetList>(new FirewallRulesetList());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallRulesetList::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> rulesetId =
        Plinth::CallSpec::ParameterSpec::New("ruleset-id", Plinth::CallSpec::PARAMETER_STRING);
    rulesetId->SetRequired(false);
    rulesetId->SetShortName("r");
    rulesetId->SetDescription("List configuration for specfic ruleset");
    inputSpec->AddParameter(rulesetId);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallRulesetList::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaList::New(3, GetOutputStructure()));
    return outputSpec;
}

boost::shared_ptr<Plinth::MetaObj::MetaStruct> FirewallRulesetList::GetOutputStructure() {
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> result = Plinth::MetaObj::MetaStruct::New("Ruleset");
    result->SetField("Name", Plinth::MetaObj::MetaString::New());
    result->SetField("Enabled", Plinth::MetaObj::MetaBool::New());
    return result;
}

void FirewallRulesetList::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                          boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    boost::shared_ptr<Plinth::MetaObj::MetaList> result = Plinth::MetaObj::MetaList::New(3, GetOutputStructure());
    std::vector<Gantry::System::FirewallRuleset*> rulesets;
    if (!SelectFirewallRulesets(systemInfo, input, output, rulesets)) {
        return;
    }
    try {
        for (Gantry::System::FirewallRuleset* ruleset : rulesets) {
            boost::shared_ptr<Plinth::MetaObj::MetaStruct> row = GetOutputStructure();
            row->SetField("Enabled", Plinth::MetaObj::MetaBool::New(ruleset->IsEnabled()));
            row->SetField("Name", Plinth::MetaObj::MetaString::New(ruleset->GetName()));
            result->AddMetaStruct(row);
        }
    } catch (Gantry::Lib::GantryException& e) {
        Trellis::Util::DeleteVector(rulesets);
        output->SetError(e.GetMessage(0));
        return;
    }
    Trellis::Util::DeleteVector(rulesets);
    output->SetResult(result);
    output->Finish();
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
