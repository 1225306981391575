#include "VirtualSwitchPortGroupRemove.h"

#include "CommandSupport.h"
#include "VirtualSwitchChange.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPortgroupName = Parameter::String("portgroup-name", "p", " ").Required();
const Parameter kVswitchName = Parameter::String("vswitch-name", "v", " ").Required();

}  // namespace

VirtualSwitchPortGroupRemove::VirtualSwitchPortGroupRemove() {
    SetDescription("Remove a port group from the given virtual switch");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupRemove::GetInputSpecInternal() {
    return InputSpecOf(kPortgroupName, kVswitchName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupRemove::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchPortGroupRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    ChangeVirtualSwitch(input, output, kVswitchName, kPortgroupName, &Gantry::Network::VirtualSwitch::RemovePortGroup);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
