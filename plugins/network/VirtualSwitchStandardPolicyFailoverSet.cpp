#include "VirtualSwitchStandardPolicyFailoverSet.h"

#include "CommandSupport.h"
#include "PolicyFolding.h"
#include "PolicyParameters.h"
#include "PolicyTargets.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName =
    Parameter::String("vswitch-name", "v",
                      "The name of the virtual switch to use when configuring the switch failover policy.")
        .Required();

}  // namespace

VirtualSwitchStandardPolicyFailoverSet::VirtualSwitchStandardPolicyFailoverSet() {
    SetDescription("Configure the Failover policy for a virtual switch.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardPolicyFailoverSet::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpecOf(kVswitchName);
    AddFailoverParameters(inputSpec);
    return inputSpec;
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardPolicyFailoverSet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchStandardPolicyFailoverSet::ExecuteInternal(boost::shared_ptr<Input> input,
                                                             boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    RunOnLegacySwitch(vswitchInfo, *input, *output, kVswitchName, [&](Gantry::Network::VirtualSwitch& vswitch) {
        Gantry::Network::NicTeamingPolicy reference = vswitch.GetTeamingPolicy();
        Gantry::Network::NicTeamingPolicy local = vswitch.GetLocalTeamingPolicy();
        std::vector<std::string> connected = vswitch.GetUplinks();
        SetFailoverPolicy(input, output, local, reference, connected);
        if (!output->HasError()) vswitch.ApplyTeamingPolicy(local);
        // A refused value leaves its text beside the true result.
        return MetaBool::New(true);
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
