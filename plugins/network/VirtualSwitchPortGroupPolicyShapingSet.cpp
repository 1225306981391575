#include "VirtualSwitchPortGroupPolicyShapingSet.h"

#include "CommandSupport.h"
#include "PolicyFolding.h"
#include "PolicyParameters.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::ShapingPolicy;

const Parameter kPortgroupName =
    Parameter::String("portgroup-name", "p", "The name of the port group to set shaping policy for.").Required();
const Parameter kUseVswitch = Parameter::Flag(
    "use-vswitch", "u",
    "Reset all values for this policy to use parent virtual switch's settings instead of overriding the settings "
    "for the port group. Using this in conjunction with other settings will first reset all of the fields to use "
    "the virtual switch setting and then apply the other options after the reset.");

// An enabled shaping needs each value set on the group or on its switch;
// each one missing from both is reported, peak first.
void ReportValuesSetNowhere(ShapingPolicy const& local, ShapingPolicy const& inForce, Output& output) {
    auto setOnEither = [&](std::uint32_t bit) { return ((local.setMask | inForce.setMask) & bit) != 0; };
    if (!setOnEither(ShapingPolicy::MASK_PEAK_BPS)) {
        output.SetError(
            "Unable to set shaping policy. A Peak BPS value must be set on either this port group or on the parent "
            "virtual switch.");
    }
    if (!setOnEither(ShapingPolicy::MASK_AVERAGE_BPS)) {
        output.SetError(
            "Unable to set shaping policy. An Average BPS value must be set on either this port group or on the "
            "parent virtual switch.");
    }
    if (!setOnEither(ShapingPolicy::MASK_BURST_SIZE)) {
        output.SetError(
            "Unable to set shaping policy. A Burst Size value must be set on either this port group or on the parent "
            "virtual switch.");
    }
}

}  // namespace

VirtualSwitchPortGroupPolicyShapingSet::VirtualSwitchPortGroupPolicyShapingSet() {
    SetDescription("Set the shaping policy settings for the given port group");
    SetMetaDataField("type", "operator");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupPolicyShapingSet::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpecOf(kPortgroupName, kUseVswitch);
    AddShapingParameters(inputSpec);
    return inputSpec;
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupPolicyShapingSet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchPortGroupPolicyShapingSet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                             boost::shared_ptr<Output> output) {
    RunOnPortGroup(*input, *output, kPortgroupName, [&](Gantry::Network::PortGroup& portGroup) {
        ShapingPolicy local = portGroup.GetLocalShapingPolicy();
        if (input->GetFlag(kUseVswitch)) local.UnsetAll();
        SetShapingPolicy(input, output, local, false);
        if ((local.setMask & ShapingPolicy::MASK_ENABLED) != 0 && local.enabled) {
            ReportValuesSetNowhere(local, portGroup.GetShapingPolicy(), *output);
        }
        if (!output->HasError()) portGroup.ApplyShapingPolicy(local);
        return MetaBool::New(true);
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
