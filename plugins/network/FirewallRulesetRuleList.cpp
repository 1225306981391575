#include "FirewallRulesetRuleList.h"

#include <string>
#include <vector>

#include "FirewallRulesetSelection.h"
#include "gantry/lib/GantryException.h"
#include "gantry/system/FirewallRule.h"
#include "gantry/system/FirewallRuleset.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaInt.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"
#include "trellis/system/SystemInfoImpl.h"
#include "util/VectorUtil"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallRulesetRuleList::FirewallRulesetRuleList() {
    SetDescription("List the rules of each ruleset in firewall.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:FirewallPortRule", "Ruleset,Direction,Protocol,Port Type,Port Begin,Port End");
}

FirewallRulesetRuleList::~FirewallRulesetRuleList() {}

boost::shared_ptr<FirewallRulesetRuleList> FirewallRulesetRuleList::New() {
    return boost::shared_ptr<FirewallRulesetRuleList>(new FirewallRulesetRuleList());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallRulesetRuleList::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> rulesetId =
        Plinth::CallSpec::ParameterSpec::New("ruleset-id", Plinth::CallSpec::PARAMETER_STRING);
    rulesetId->SetRequired(false);
    rulesetId->SetShortName("r");
    rulesetId->SetDescription("List rules for specfic ruleset");
    inputSpec->AddParameter(rulesetId);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallRulesetRuleList::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaList::New(3, GetOutputStructure()));
    return outputSpec;
}

boost::shared_ptr<Plinth::MetaObj::MetaStruct> FirewallRulesetRuleList::GetOutputStructure() {
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> result = Plinth::MetaObj::MetaStruct::New("FirewallPortRule");
    result->SetField("Ruleset", Plinth::MetaObj::MetaString::New());
    result->SetField("Port Type", Plinth::MetaObj::MetaString::New());
    result->SetField("Port Begin", Plinth::MetaObj::MetaInt::New());
    result->SetField("Port End", Plinth::MetaObj::MetaInt::New());
    result->SetField("Direction", Plinth::MetaObj::MetaString::New());
    result->SetField("Protocol", Plinth::MetaObj::MetaString::New());
    return result;
}

void FirewallRulesetRuleList::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                              boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    boost::shared_ptr<Plinth::MetaObj::MetaList> result = Plinth::MetaObj::MetaList::New(3, GetOutputStructure());
    std::vector<Gantry::System::FirewallRuleset*> rulesets;
    if (!SelectFirewallRulesets(systemInfo, input, output, rulesets)) {
        return;
    }
    std::vector<Gantry::System::FirewallRule*> rules;
    try {
        for (Gantry::System::FirewallRuleset* ruleset : rulesets) {
            std::string name = ruleset->GetName();
            rules = ruleset->GetRules();
            for (Gantry::System::FirewallRule* rule : rules) {
                boost::shared_ptr<Plinth::MetaObj::MetaStruct> row = GetOutputStructure();
                bool destination = rule->portType == Gantry::System::FirewallRule::PORT_TYPE_DST;
                bool inbound = rule->direction == Gantry::System::FirewallRule::DIRECTION_INBOUND;
                bool tcp = rule->protocol == Gantry::System::FirewallRule::PROTOCOL_TCP;
                row->SetField("Ruleset", Plinth::MetaObj::MetaString::New(name));
                row->SetField("Port Type", Plinth::MetaObj::MetaString::New(destination ? "Dst" : "Src"));
                row->SetField("Port Begin", Plinth::MetaObj::MetaInt::New(rule->portBegin));
                row->SetField("Port End", Plinth::MetaObj::MetaInt::New(rule->portEnd));
                row->SetField("Direction", Plinth::MetaObj::MetaString::New(inbound ? "Inbound" : "Outbound"));
                row->SetField("Protocol", Plinth::MetaObj::MetaString::New(tcp ? "TCP" : "UDP"));
                result->AddMetaStruct(row);
            }
            Trellis::Util::DeleteVector(rules);
        }
    } catch (Gantry::Lib::GantryException& e) {
        Trellis::Util::DeleteVector(rules);
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
