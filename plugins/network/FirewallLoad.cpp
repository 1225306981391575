#include "FirewallLoad.h"

#include "gantry/lib/GantryException.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallLoad::FirewallLoad() {
    SetDescription("Load firewall module and rulesets configuration.");
    SetMetaDataField("type", "operation");
}

FirewallLoad::~FirewallLoad() {}

boost::shared_ptr<FirewallLoad> FirewallLoad::New() { return boost::shared_ptr<FirewallLoad>(new FirewallLoad()); }

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallLoad::GetInputSpecInternal() {
    return Plinth::CallSpec::InputSpec::New();
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallLoad::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void FirewallLoad::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> /*input*/,
                                   boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    try {
        // Whatever the module answers for a module that is loaded already stands.
        Trellis::System::ModuleImpl module("haldenfw");
        module.Load("", false);
        systemInfo.LoadFirewallRulesets();
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
