#include "VirtualSwitchStandardUplinkAdd.h"

#include "CommandSupport.h"
#include "VirtualSwitchChange.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName =
    Parameter::String("vswitch-name", "v", "The name of the virtual switch to add an uplink to.").Required();
const Parameter kUplinkName =
    Parameter::String("uplink-name", "u", "The name of the uplink to add to the virtual switch.").Required();

}  // namespace

VirtualSwitchStandardUplinkAdd::VirtualSwitchStandardUplinkAdd() {
    SetDescription(
        "Add an uplink to the given virtual switch. Note if this virtual switch has a NIC teaming policy "
        "assigned to it then the policy must also be modified to enable use of this uplink on this virtual "
        "switch");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardUplinkAdd::GetInputSpecInternal() {
    return InputSpecOf(kVswitchName, kUplinkName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardUplinkAdd::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchStandardUplinkAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    ChangeVirtualSwitch(input, output, kVswitchName, kUplinkName, &Gantry::Network::VirtualSwitch::AddUplink);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
