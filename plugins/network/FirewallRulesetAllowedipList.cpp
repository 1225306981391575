#include "FirewallRulesetAllowedipList.h"

#include <vector>

#include "FirewallRulesetSelection.h"
#include "gantry/lib/GantryException.h"
#include "gantry/system/FirewallAllowedIpList.h"
#include "gantry/system/FirewallRuleset.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaList.h"
#include "plinth/metaobj/MetaString.h"
#include "trellis/system/SystemInfoImpl.h"
#include "util/VectorUtil"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallRulesetAllowedipList::FirewallRulesetAllowedipList() {
    SetDescription("list allowed ip addresses for rulesets.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:FirewallRulesetAllowedip", "Ruleset,Allowed IP Addresses");
}

FirewallRulesetAllowedipList::~FirewallRulesetAllowedipList() {}

boost::shared_ptr<FirewallRulesetAllowedipList> FirewallRulesetAllowedipList::New() {
    return boost::shared_ptr<FirewallRulesetAllowedipList>(new FirewallRulesetAllowedipList());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallRulesetAllowedipList::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> rulesetId =
        Plinth::CallSpec::ParameterSpec::New("ruleset-id", Plinth::CallSpec::PARAMETER_STRING);
    rulesetId->SetRequired(false);
    rulesetId->SetShortName("r");
    rulesetId->SetDescription("The label of the ruleset.");
    inputSpec->AddParameter(rulesetId);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallRulesetAllowedipList::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaList::New(3, GetOutputStructure()));
    return outputSpec;
}

boost::shared_ptr<Plinth::MetaObj::MetaStruct> FirewallRulesetAllowedipList::GetOutputStructure() {
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> result =
        Plinth::MetaObj::MetaStruct::New("FirewallRulesetAllowedip");
    result->SetField("Ruleset", Plinth::MetaObj::MetaString::New());
    result->SetField("Allowed IP Addresses", Plinth::MetaObj::MetaList::New(2));
    return result;
}

void FirewallRulesetAllowedipList::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                                   boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    boost::shared_ptr<Plinth::MetaObj::MetaList> result = Plinth::MetaObj::MetaList::New(3, GetOutputStructure());
    std::vector<Gantry::System::FirewallRuleset*> rulesets;
    if (!SelectFirewallRulesets(systemInfo, input, output, rulesets)) {
        return;
    }
    Gantry::System::FirewallAllowedIpList* allowedIps = nullptr;
    try {
        for (Gantry::System::FirewallRuleset* ruleset : rulesets) {
            boost::shared_ptr<Plinth::MetaObj::MetaStruct> row = GetOutputStructure();
            boost::shared_ptr<Plinth::MetaObj::MetaList> addresses = Plinth::MetaObj::MetaList::New(2);
            row->SetField("Ruleset", Plinth::MetaObj::MetaString::New(ruleset->GetName()));
            if (ruleset->IsAllowedAll()) {
                addresses->AddString("All");
            } else {
                // Addresses before networks, IPv4 before IPv6 within each.
                allowedIps = ruleset->GetAllowedIpList();
                for (const Gantry::Network::Ipv4Address& address : allowedIps->ipv4Addresses) {
                    addresses->AddString(address.GetStringAddress());
                }
                for (const Gantry::Network::Ipv6Address& address : allowedIps->ipv6Addresses) {
                    addresses->AddString(address.GetStringAddress());
                }
                for (const Gantry::Network::Ipv4Network& network : allowedIps->ipv4Networks) {
                    addresses->AddString(network.GetStringAddress());
                }
                for (const Gantry::Network::Ipv6Network& network : allowedIps->ipv6Networks) {
                    addresses->AddString(network.GetStringAddress());
                }
                delete allowedIps;
                allowedIps = nullptr;
            }
            row->SetField("Allowed IP Addresses", addresses);
            result->AddMetaStruct(row);
        }
    } catch (Gantry::Lib::GantryException& e) {
        delete allowedIps;
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
