#include "FirewallRulesetRuleList.h"

#include "CommandSupport.h"
#include "FirewallRulesetSelection.h"
#include "gantry/system/FirewallRule.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::System::FirewallRule;

const Parameter kRulesetId = Parameter::String("ruleset-id", "r", "List rules for specfic ruleset");

}  // namespace

FirewallRulesetRuleList::FirewallRulesetRuleList() {
    SetDescription("List the rules of each ruleset in firewall.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:FirewallPortRule", "Ruleset,Direction,Protocol,Port Type,Port Begin,Port End");
}

boost::shared_ptr<InputSpec> FirewallRulesetRuleList::GetInputSpecInternal() { return InputSpecOf(kRulesetId); }

boost::shared_ptr<OutputSpec> FirewallRulesetRuleList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(3, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> FirewallRulesetRuleList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("FirewallPortRule");
    result->SetField("Ruleset", MetaString::New());
    result->SetField("Port Type", MetaString::New());
    result->SetField("Port Begin", MetaInt::New());
    result->SetField("Port End", MetaInt::New());
    result->SetField("Direction", MetaString::New());
    result->SetField("Protocol", MetaString::New());
    return result;
}

void FirewallRulesetRuleList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    boost::shared_ptr<MetaList> result = MetaList::New(3, GetOutputStructure());
    OwnedVector<Gantry::System::FirewallRuleset> rulesets;
    if (!SelectFirewallRulesets(systemInfo, input, kRulesetId, output, rulesets)) {
        return;
    }
    try {
        for (Gantry::System::FirewallRuleset* ruleset : rulesets) {
            std::string name = ruleset->GetName();
            OwnedVector<FirewallRule> rules(ruleset->GetRules());
            for (FirewallRule* rule : rules) {
                boost::shared_ptr<MetaStruct> row = GetOutputStructure();
                bool destination = rule->portType == FirewallRule::PORT_TYPE_DST;
                bool inbound = rule->direction == FirewallRule::DIRECTION_INBOUND;
                bool tcp = rule->protocol == FirewallRule::PROTOCOL_TCP;
                row->SetField("Ruleset", MetaString::New(name));
                row->SetField("Port Type", MetaString::New(destination ? "Dst" : "Src"));
                row->SetField("Port Begin", MetaInt::New(rule->portBegin));
                row->SetField("Port End", MetaInt::New(rule->portEnd));
                row->SetField("Direction", MetaString::New(inbound ? "Inbound" : "Outbound"));
                row->SetField("Protocol", MetaString::New(tcp ? "TCP" : "UDP"));
                result->AddMetaStruct(row);
            }
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
