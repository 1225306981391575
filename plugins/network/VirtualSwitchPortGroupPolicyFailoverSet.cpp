#include "VirtualSwitchPortGroupPolicyFailoverSet.h"

#include "CommandSupport.h"
#include "PolicyFolding.h"
#include "PolicyParameters.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPortgroupName =
    Parameter::String("portgroup-name", "p", "The name of the port group to set failover policy for.").Required();
const Parameter kUseVswitch = Parameter::Flag(
    "use-vswitch", "u",
    "Reset all values for this policy to use parent virtual switch's settings instead of overriding the settings "
    "for the port group. Using this in conjunction with other settings will first reset all of the fields to use "
    "the virtual switch setting and then apply the other options after the reset.");

}  // namespace

VirtualSwitchPortGroupPolicyFailoverSet::VirtualSwitchPortGroupPolicyFailoverSet() {
    SetDescription(
        "Configure the Failover policy for a port group. These setting may potentially override virtual switch "
        "settings.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupPolicyFailoverSet::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpecOf(kPortgroupName, kUseVswitch);
    AddFailoverParameters(inputSpec);
    return inputSpec;
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupPolicyFailoverSet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchPortGroupPolicyFailoverSet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                              boost::shared_ptr<Output> output) {
    RunOnPortGroup(*input, *output, kPortgroupName, [&](Gantry::Network::PortGroup& portGroup) {
        // The reference is taken before the reset, so that it still shows the
        // overrides that the reset is about to remove.
        Gantry::Network::NicTeamingPolicy local = portGroup.GetLocalTeamingPolicy();
        Gantry::Network::NicTeamingPolicy reference = portGroup.GetTeamingPolicy();
        std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch(portGroup.GetVirtualSwitch());
        std::vector<std::string> connected = vswitch->GetUplinks();
        if (input->GetFlag(kUseVswitch)) local.UnsetAll();
        SetFailoverPolicy(input, output, local, reference, connected);
        if (!output->HasError()) portGroup.ApplyTeamingPolicy(local);
        return MetaBool::New(true);
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
