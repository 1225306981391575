#include "FirewallRefresh.h"

#include <vector>

#include "gantry/lib/GantryException.h"
#include "gantry/system/FirewallRule.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "trellis/system/SystemInfoImpl.h"
#include "util/VectorUtil"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallRefresh::FirewallRefresh() {
    SetDescription("Load ruleset configuration for firewall.");
    SetMetaDataField("type", "operation");
}

FirewallRefresh::~FirewallRefresh() {}

boost::shared_ptr<FirewallRefresh> FirewallRefresh::New() {
    return boost::shared_ptr<FirewallRefresh>(new FirewallRefresh());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallRefresh::GetInputSpecInternal() {
    return Plinth::CallSpec::InputSpec::New();
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallRefresh::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void FirewallRefresh::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> /*input*/,
                                      boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    // Loading the rulesets drops the dynamic rules; they are saved and put back.
    std::vector<Gantry::System::FirewallRule*> dynamicRules;
    try {
        dynamicRules = systemInfo.GetFirewallDynamicRules();
        systemInfo.LoadFirewallRulesets();
        for (Gantry::System::FirewallRule* rule : dynamicRules) {
            systemInfo.AddFirewallDynamicRule(*rule);
        }
        Trellis::Util::DeleteVector(dynamicRules);
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        Trellis::Util::DeleteVector(dynamicRules);
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
