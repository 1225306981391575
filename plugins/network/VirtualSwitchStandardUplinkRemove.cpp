#include "VirtualSwitchStandardUplinkRemove.h"

#include "CommandSupport.h"
#include "VirtualSwitchChange.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName =
    Parameter::String("vswitch-name", "v", "The name of the virtual switch to remove an uplink from.").Required();
const Parameter kUplinkName =
    Parameter::String("uplink-name", "u", "The name of the uplink to remove from the virtual switch.").Required();

}  // namespace

VirtualSwitchStandardUplinkRemove::VirtualSwitchStandardUplinkRemove() {
    SetDescription(
        "Remove an uplink from the given virtual switch. Note if this virtual switch has a NIC teaming policy "
        "assigned to it then the policy must also be modified to disable use of this uplink on this virtual "
        "switch");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardUplinkRemove::GetInputSpecInternal() {
    return InputSpecOf(kVswitchName, kUplinkName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardUplinkRemove::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchStandardUplinkRemove::ExecuteInternal(boost::shared_ptr<Input> input,
                                                        boost::shared_ptr<Output> output) {
    ChangeVirtualSwitch(input, output, kVswitchName, kUplinkName, &Gantry::Network::VirtualSwitch::RemoveUplink);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
