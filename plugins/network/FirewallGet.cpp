#include "FirewallGet.h"

#include "CommandSupport.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallGet::FirewallGet() {
    SetDescription("Get the firewall status.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

boost::shared_ptr<InputSpec> FirewallGet::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> FirewallGet::GetOutputSpecInternal() { return OutputSpec::Of(GetOutputStructure()); }

boost::shared_ptr<MetaStruct> FirewallGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Firewall");
    result->SetField("Loaded", MetaBool::New());
    result->SetField("Enabled", MetaBool::New());
    result->SetField("DefaultAction", MetaString::New());
    return result;
}

void FirewallGet::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    try {
        Trellis::System::ModuleImpl module("haldenfw");
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        bool loaded = module.IsLoaded();
        // An unloaded module is asked nothing more: it reads as disabled, passing all.
        bool enabled = false;
        bool defaultAction = true;
        if (loaded) {
            enabled = systemInfo.IsFirewallEnabled();
            defaultAction = systemInfo.GetFirewallDefaultAction();
        }
        result->SetField("Loaded", MetaBool::New(loaded));
        result->SetField("Enabled", MetaBool::New(enabled));
        result->SetField("DefaultAction", MetaString::New(defaultAction ? "PASS" : "DROP"));
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to get firewall status.\n" + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
