#include "VirtualSwitchPortGroupPolicySecuritySet.h"

#include "CommandSupport.h"
#include "PolicyFolding.h"
#include "PolicyParameters.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPortgroupName =
    Parameter::String("portgroup-name", "p", "The name of the port group to set security policy for.").Required();
const Parameter kUseVswitch = Parameter::Flag(
    "use-vswitch", "u",
    "Reset all values for this policy to use parent virtual switch's settings instead of overriding the settings "
    "for the port group.   Using this in conjunction with other settings will first reset all of the fields to "
    "use the virtual switch setting and then apply the other options after the reset.");

}  // namespace

VirtualSwitchPortGroupPolicySecuritySet::VirtualSwitchPortGroupPolicySecuritySet() {
    SetDescription("Set the security policy for a given port group");
    SetMetaDataField("type", "operator");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupPolicySecuritySet::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpecOf(kPortgroupName, kUseVswitch);
    AddSecurityParameters(inputSpec);
    return inputSpec;
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupPolicySecuritySet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchPortGroupPolicySecuritySet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                              boost::shared_ptr<Output> output) {
    RunOnPortGroup(*input, *output, kPortgroupName, [&](Gantry::Network::PortGroup& portGroup) {
        Gantry::Network::PortSecurityPolicy local = portGroup.GetLocalSecurityPolicy();
        if (input->GetFlag(kUseVswitch)) local.UnsetAll();
        SetSecurityPolicy(input, output, local);
        if (!output->HasError()) portGroup.ApplySecurityPolicy(local);
        return MetaBool::New(true);
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
