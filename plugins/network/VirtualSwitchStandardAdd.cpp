#include "VirtualSwitchStandardAdd.h"

#include "gantry/lib/GantryException.h"
#include "gantry/network/NicCapabilities.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/Portset.h"
#include "gantry/network/ShapingPolicy.h"
#include "gantry/network/VirtualSwitch.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterConstraint.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchStandardAdd::VirtualSwitchStandardAdd() {
    SetDescription("Add a new virtual switch to the Halden networking system.");
    SetMetaDataField("type", "operation");
}

VirtualSwitchStandardAdd::~VirtualSwitchStandardAdd() {}

boost::shared_ptr<VirtualSwitchStandardAdd> VirtualSwitchStandardAdd::New() {
    return boost::shared_ptr<VirtualSwitchStandardAdd>(new VirtualSwitchStandardAdd());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchStandardAdd::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vswitchName =
        Plinth::CallSpec::ParameterSpec::New("vswitch-name", Plinth::CallSpec::PARAMETER_STRING);
    vswitchName->SetRequired(true);
    vswitchName->SetShortName("v");
    vswitchName->SetDescription("The name of the virtual switch to create.");
    inputSpec->AddParameter(vswitchName);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> ports =
        Plinth::CallSpec::ParameterSpec::New("ports", Plinth::CallSpec::PARAMETER_INT);
    ports->SetRequired(false);
    ports->SetShortName("P");
    ports->SetDescription(
        "The number of ports to to give this newly created virtual switch. Maximum ports per virtual switch is "
        "4096. If no value is given the default value(128) is used. The number of ports is limited by the number "
        "of already allocated ports on the host. The system wide port count cannot be greater than 4608.");
    boost::shared_ptr<Plinth::CallSpec::ParameterConstraint> portsRange =
        Plinth::CallSpec::ParameterConstraint::New(Plinth::CallSpec::CONSTRAINT_INT_RANGE);
    portsRange->SetIntRange(1, 4096);
    ports->SetConstraint(portsRange);
    inputSpec->AddParameter(ports);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchStandardAdd::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void VirtualSwitchStandardAdd::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                               boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString("vswitch-name");
        int numPorts = Gantry::Network::Portset::DEF_NUM_PORTS;
        if (input->HasParameter("ports")) {
            numPorts = input->GetInt("ports");
        }
        Gantry::Network::NicCapabilities capabilities = Gantry::Network::NicCapabilities::GetDefaultPolicy();
        Gantry::Network::ShapingPolicy shaping = Gantry::Network::ShapingPolicy::GetDefaultPolicy();
        Gantry::Network::PortSecurityPolicy security = Gantry::Network::PortSecurityPolicy::GetDefaultPolicy();
        Gantry::Network::NicTeamingPolicy teaming = Gantry::Network::NicTeamingPolicy::GetDefaultPolicy();
        Gantry::Network::VirtualSwitch* vswitch =
            vswitchInfo.AddVirtualSwitchWithPolicy(teaming, security, shaping, capabilities, name, numPorts);
        delete vswitch;
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
