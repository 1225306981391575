#include "VirtualSwitchStandardPolicyShapingGet.h"

#include "CommandSupport.h"
#include "PolicyFields.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName = Parameter::String(
    "vswitch-name", "v", "The name of the virtual switch to use when fetching the switch shaping policy.").Required();

}  // namespace

VirtualSwitchStandardPolicyShapingGet::VirtualSwitchStandardPolicyShapingGet() {
    SetDescription("Get the shaping policy settings for the given virtual switch");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("fields:VirtualSwitchTrafficShapingPolicy",
                              "Enabled,Average Bandwidth,Peak Bandwidth,Burst Size");
    SetDefaultOutputParameter("header:VirtualSwitchTrafficShapingPolicy", "<NONE>");
    SetDefaultOutputParameter("units:VirtualSwitchTrafficShapingPolicy.Average Bandwidth", "Kbps");
    SetDefaultOutputParameter("units:VirtualSwitchTrafficShapingPolicy.Peak Bandwidth", "Kbps");
    SetDefaultOutputParameter("units:VirtualSwitchTrafficShapingPolicy.Burst Size", "Kib");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardPolicyShapingGet::GetInputSpecInternal() {
    return InputSpecOf(kVswitchName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardPolicyShapingGet::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> VirtualSwitchStandardPolicyShapingGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("VirtualSwitchTrafficShapingPolicy");
    DeclareShapingFields(*result);
    return result;
}

void VirtualSwitchStandardPolicyShapingGet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                            boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    boost::shared_ptr<MetaStruct> result = GetOutputStructure();
    RunOnLegacySwitch(vswitchInfo, *input, *output, kVswitchName, [&](Gantry::Network::VirtualSwitch& vswitch) {
        SetShapingFields(*result, vswitch.GetShapingPolicy());
        return result;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
