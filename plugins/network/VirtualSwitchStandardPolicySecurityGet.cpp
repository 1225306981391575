#include "VirtualSwitchStandardPolicySecurityGet.h"

#include "CommandSupport.h"
#include "PolicyFields.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName = Parameter::String(
    "vswitch-name", "v", "The name of the virtual switch to use when fetching the network security policy.").Required();

}  // namespace

VirtualSwitchStandardPolicySecurityGet::VirtualSwitchStandardPolicySecurityGet() {
    SetDescription("Get the Security Policy governing the given virtual switch.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("fields:VirtualSwitchSecurityPolicy",
                              "Allow Promiscuous,Allow MAC Address Change,Allow Forged Transmits");
    SetDefaultOutputParameter("header:VirtualSwitchSecurityPolicy", "<NONE>");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardPolicySecurityGet::GetInputSpecInternal() {
    return InputSpecOf(kVswitchName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardPolicySecurityGet::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> VirtualSwitchStandardPolicySecurityGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VirtualSwitchSecurityPolicy");
    result->SetField("Allow Promiscuous", MetaBool::New());
    result->SetField("Allow MAC Address Change", MetaBool::New());
    result->SetField("Allow Forged Transmits", MetaBool::New());
    return result;
}

void VirtualSwitchStandardPolicySecurityGet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                             boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVswitchName);
        // The structure is named here and takes its fields as they are set.
        boost::shared_ptr<MetaStruct> result = MetaStruct::New("VirtualSwitchSecurityPolicy");
        std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch = FindLegacyVirtualSwitch(vswitchInfo, name, *output);
        if (!vswitch) return;
        SetSecurityFields(*result, vswitch->GetSecurityPolicy());
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
