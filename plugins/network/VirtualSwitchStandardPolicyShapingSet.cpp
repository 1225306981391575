#include "VirtualSwitchStandardPolicyShapingSet.h"

#include "CommandSupport.h"
#include "PolicyFolding.h"
#include "PolicyParameters.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName = Parameter::String(
    "vswitch-name", "v", "The name of the virtual switch to use when setting the switch shaping policy.").Required();

}  // namespace

VirtualSwitchStandardPolicyShapingSet::VirtualSwitchStandardPolicyShapingSet() {
    SetDescription("Set the shaping policy settings for the given virtual switch");
    SetMetaDataField("type", "operator");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardPolicyShapingSet::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpecOf(kVswitchName);
    AddShapingParameters(inputSpec);
    return inputSpec;
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardPolicyShapingSet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchStandardPolicyShapingSet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                            boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVswitchName);
        std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch = FindLegacyVirtualSwitch(vswitchInfo, name, *output);
        if (!vswitch) return;
        // The policy in force is the base: storing it sets every field at this level.
        Gantry::Network::ShapingPolicy policy = vswitch->GetShapingPolicy();
        SetShapingPolicy(input, output, policy, false);
        if (!output->HasError()) vswitch->ApplyShapingPolicy(policy);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
