#include "FirewallUnload.h"

#include "gantry/lib/GantryException.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallUnload::FirewallUnload() {
    SetDescription("Allow unload firewall module.");
    SetMetaDataField("type", "operation");
}

FirewallUnload::~FirewallUnload() {}

boost::shared_ptr<FirewallUnload> FirewallUnload::New() {
    return boost::shared_ptr<FirewallUnload>(new FirewallUnload());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallUnload::GetInputSpecInternal() {
    return Plinth::CallSpec::InputSpec::New();
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallUnload::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void FirewallUnload::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> /*input*/,
                                     boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    try {
        Trellis::System::ModuleImpl module("haldenfw");
        if (module.IsLoaded()) {
            systemInfo.DestroyFirewallFilters();
            module.Unload();
        }
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
