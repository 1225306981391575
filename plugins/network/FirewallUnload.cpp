#include "FirewallUnload.h"

#include "CommandSupport.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallUnload::FirewallUnload() {
    SetDescription("Allow unload firewall module.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> FirewallUnload::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> FirewallUnload::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void FirewallUnload::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    try {
        Trellis::System::ModuleImpl module("haldenfw");
        if (module.IsLoaded()) {
            systemInfo.DestroyFirewallFilters();
            module.Unload();
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
