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
    DeclareSecurityFields(*result);
    return result;
}

void VirtualSwitchStandardPolicySecurityGet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                             boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    // The structure is named here and takes its fields as they are set.
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VirtualSwitchSecurityPolicy");
    RunOnLegacySwitch(vswitchInfo, *input, *output, kVswitchName, [&](Gantry::Network::VirtualSwitch& vswitch) {
        SetSecurityFields(*result, vswitch.GetSecurityPolicy());
        return result;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
