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
    RunOnLegacySwitch(vswitchInfo, *input, *output, kVswitchName, [&](Gantry::Network::VirtualSwitch& vswitch) {
        // The policy in force is the base: storing it sets every field at this level.
        Gantry::Network::ShapingPolicy policy = vswitch.GetShapingPolicy();
        SetShapingPolicy(input, output, policy, false);
        if (!output->HasError()) vswitch.ApplyShapingPolicy(policy);
        return MetaBool::New(true);
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
