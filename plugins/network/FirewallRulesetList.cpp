#include "FirewallRulesetList.h"

#include "CommandSupport.h"
#include "FirewallRulesetSelection.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kRulesetId = Parameter::String("ruleset-id", "r", "List configuration for specfic ruleset");

}  // namespace

FirewallRulesetList::FirewallRulesetList() {
    SetDescription("List the rulesets in firewall.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:Ruleset", "Name,Enabled");
}

boost::shared_ptr<InputSpec> FirewallRulesetList::GetInputSpecInternal() { return InputSpecOf(kRulesetId); }

boost::shared_ptr<OutputSpec> FirewallRulesetList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(3, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> FirewallRulesetList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Ruleset");
    result->SetField("Name", MetaString::New());
    result->SetField("Enabled", MetaBool::New());
    return result;
}

void FirewallRulesetList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    boost::shared_ptr<MetaList> result = MetaList::New(3, GetOutputStructure());
    OwnedVector<Gantry::System::FirewallRuleset> rulesets;
    if (!SelectFirewallRulesets(systemInfo, input, kRulesetId, output, rulesets)) {
        return;
    }
    try {
        for (Gantry::System::FirewallRuleset* ruleset : rulesets) {
            boost::shared_ptr<MetaStruct> row = GetOutputStructure();
            row->SetField("Enabled", MetaBool::New(ruleset->IsEnabled()));
            row->SetField("Name", MetaString::New(ruleset->GetName()));
            result->AddMetaStruct(row);
        }
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
        return;
    }
    output->SetResult(result);
    output->Finish();
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
