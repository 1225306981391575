#include "FirewallGet.h"

#include "gantry/lib/GantryException.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "plinth/metaobj/MetaString.h"
#include "trellis/system/ModuleImpl.h"
#include "trellis/system/SystemInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

FirewallGet::FirewallGet() {
    SetDescription("Get the firewall status.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

FirewallGet::~FirewallGet() {}

boost::shared_ptr<FirewallGet> FirewallGet::New() { return boost::shared_ptr<FirewallGet>(new FirewallGet()); }

boost::shared_ptr<Plinth::CallSpec::InputSpec> FirewallGet::GetInputSpecInternal() {
    return Plinth::CallSpec::InputSpec::New();
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> FirewallGet::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(GetOutputStructure());
    return outputSpec;
}

boost::shared_ptr<Plinth::MetaObj::MetaStruct> FirewallGet::GetOutputStructure() {
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> result = Plinth::MetaObj::MetaStruct::New("Firewall");
    result->SetField("Loaded", Plinth::MetaObj::MetaBool::New());
    result->SetField("Enabled", Plinth::MetaObj::MetaBool::New());
    result->SetField("DefaultAction", Plinth::MetaObj::MetaString::New());
    return result;
}

void FirewallGet::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> /*input*/,
                                  boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::System::SystemInfoImpl systemInfo;
    try {
        Trellis::System::ModuleImpl module("haldenfw");
        boost::shared_ptr<Plinth::MetaObj::MetaStruct> result = GetOutputStructure();
        bool loaded = module.IsLoaded();
        // An unloaded module is asked nothing more: it reads as disabled, passing all.
        bool enabled = false;
        bool defaultAction = true;
        if (loaded) {
            enabled = systemInfo.IsFirewallEnabled();
            defaultAction = systemInfo.GetFirewallDefaultAction();
        }
        result->SetField("Loaded", Plinth::MetaObj::MetaBool::New(loaded));
        result->SetField("Enabled", Plinth::MetaObj::MetaBool::New(enabled));
        result->SetField("DefaultAction", Plinth::MetaObj::MetaString::New(defaultAction ? "PASS" : "DROP"));
        output->SetResult(result);
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        output->SetError("Unable to get firewall status.\n" + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
