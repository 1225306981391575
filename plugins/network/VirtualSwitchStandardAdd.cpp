#include "VirtualSwitchStandardAdd.h"

#include "CommandSupport.h"
#include "gantry/network/NicCapabilities.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/Portset.h"
#include "gantry/network/ShapingPolicy.h"
#include "gantry/network/VirtualSwitch.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName =
    Parameter::String("vswitch-name", "v", "The name of the virtual switch to create.").Required();
const Parameter kPorts =
    Parameter::Int("ports", "P",
                   "The number of ports to to give this newly created virtual switch. Maximum ports per virtual "
                   "switch is 4096. If no value is given the default value(128) is used. The number of ports is "
                   "limited by the number of already allocated ports on the host. The system wide port count "
                   "cannot be greater than 4608.")
        .Range(1, 4096);

}  // namespace

VirtualSwitchStandardAdd::VirtualSwitchStandardAdd() {
    SetDescription("Add a new virtual switch to the Halden networking system.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardAdd::GetInputSpecInternal() {
    return InputSpecOf(kVswitchName, kPorts);
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardAdd::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchStandardAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVswitchName);
        int numPorts = Gantry::Network::Portset::DEF_NUM_PORTS;
        if (input->HasParameter(kPorts)) {
            numPorts = input->GetInt(kPorts);
        }
        Gantry::Network::NicCapabilities capabilities = Gantry::Network::NicCapabilities::GetDefaultPolicy();
        Gantry::Network::ShapingPolicy shaping = Gantry::Network::ShapingPolicy::GetDefaultPolicy();
        Gantry::Network::PortSecurityPolicy security = Gantry::Network::PortSecurityPolicy::GetDefaultPolicy();
        Gantry::Network::NicTeamingPolicy teaming = Gantry::Network::NicTeamingPolicy::GetDefaultPolicy();
        std::unique_ptr<Gantry::Network::VirtualSwitch> added(
            vswitchInfo.AddVirtualSwitchWithPolicy(teaming, security, shaping, capabilities, name, numPorts));
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
