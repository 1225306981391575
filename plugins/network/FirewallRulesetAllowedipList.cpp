#include "FirewallRulesetAllowedipList.h"

#include "CommandSupport.h"
#include "FirewallRulesetSelection.h"
#include "gantry/system/FirewallAllowedIpList.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kRulesetId = Parameter::String("ruleset-id", "r", "The label of the ruleset.");

// Addresses before networks, IPv4 before IPv6 within each.
void AppendAllowedIps(Gantry::System::FirewallAllowedIpList const& allowedIps, MetaList& addresses) {
    for (Gantry::Network::Ipv4Address const& address : allowedIps.ipv4Addresses) {
        addresses.AddString(address.GetStringAddress());
    }
    for (Gantry::Network::Ipv6Address const& address : allowedIps.ipv6Addresses) {
        addresses.AddString(address.GetStringAddress());
    }
    for (Gantry::Network::Ipv4Network const& network : allowedIps.ipv4Networks) {
        addresses.AddString(network.GetStringAddress());
    }
    for (Gantry::Network::Ipv6Network const& network : allowedIps.ipv6Networks) {
        addresses.AddString(network.GetStringAddress());
    }
}

}  // namespace

FirewallRulesetAllowedipList::FirewallRulesetAllowedipList() {
    SetDescription("list allowed ip addresses for rulesets.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:FirewallRulesetAllowedip", "Ruleset,Allowed IP Addresses");
}

boost::shared_ptr<InputSpec> FirewallRulesetAllowedipList::GetInputSpecInternal() { return InputSpecOf(kRulesetId); }

boost::shared_ptr<OutputSpec> FirewallRulesetAllowedipList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(3, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> FirewallRulesetAllowedipList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("FirewallRulesetAllowedip");
    result->SetField("Ruleset", MetaString::New());
    result->SetField("Allowed IP Addresses", MetaList::New(2));
    return result;
}

void FirewallRulesetAllowedipList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    boost::shared_ptr<MetaList> result = MetaList::New(3, GetOutputStructure());
    OwnedVector<Gantry::System::FirewallRuleset> rulesets;
    if (!SelectFirewallRulesets(systemInfo, input, kRulesetId, output, rulesets)) {
        return;
    }
    try {
        for (Gantry::System::FirewallRuleset* ruleset : rulesets) {
            boost::shared_ptr<MetaStruct> row = GetOutputStructure();
            boost::shared_ptr<MetaList> addresses = MetaList::New(2);
            row->SetField("Ruleset", MetaString::New(ruleset->GetName()));
            if (ruleset->IsAllowedAll()) {
                addresses->AddString("All");
            } else {
                std::unique_ptr<Gantry::System::FirewallAllowedIpList> allowedIps(ruleset->GetAllowedIpList());
                AppendAllowedIps(*allowedIps, *addresses);
            }
            row->SetField("Allowed IP Addresses", addresses);
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
