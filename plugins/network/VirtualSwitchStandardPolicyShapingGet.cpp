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
    result->SetField("Enabled", MetaBool::New());
    result->SetField("Average Bandwidth", MetaInt::New());
    result->SetField("Peak Bandwidth", MetaInt::New());
    result->SetField("Burst Size", MetaInt::New());
    return result;
}

void VirtualSwitchStandardPolicyShapingGet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                            boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVswitchName);
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch = FindLegacyVirtualSwitch(vswitchInfo, name, *output);
        if (!vswitch) return;
        SetShapingFields(*result, vswitch->GetShapingPolicy());
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
