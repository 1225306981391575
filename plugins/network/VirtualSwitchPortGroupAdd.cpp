#include "VirtualSwitchPortGroupAdd.h"

#include "CommandSupport.h"
#include "VirtualSwitchChange.h"
#include "gantry/network/PortGroup.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPortgroupName =
    Parameter::String("portgroup-name", "p", "The name of the port group to add").Required();
const Parameter kVswitchName =
    Parameter::String("vswitch-name", "v", "The virtual switch to add the port group to.").Required();

}  // namespace

VirtualSwitchPortGroupAdd::VirtualSwitchPortGroupAdd() {
    SetDescription("Allows the addition of a standard port group to a virtual switch.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchPortGroupAdd::GetInputSpecInternal() {
    return InputSpecOf(kPortgroupName, kVswitchName);
}

boost::shared_ptr<OutputSpec> VirtualSwitchPortGroupAdd::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchPortGroupAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    ChangeVirtualSwitch(input, output, kVswitchName, kPortgroupName,
                        [](Gantry::Network::VirtualSwitch& vswitch, std::string const& portGroupName) {
                            std::unique_ptr<Gantry::Network::PortGroup> added(vswitch.AddPortGroup(portGroupName));
                        });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
