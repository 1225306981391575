#include "VirtualSwitchPortGroupAdd.h"

#include "gantry/lib/GantryException.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/PortGroup.h"
#include "gantry/network/VirtualSwitch.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupAdd::VirtualSwitchPortGroupAdd() {
    SetDescription("Allows the addition of a standard port group to a virtual switch.");
    SetMetaDataField("type", "operation");
}

VirtualSwitchPortGroupAdd::~VirtualSwitchPortGroupAdd() {}

boost::shared_ptr<VirtualSwitchPortGroupAdd> VirtualSwitchPortGroupAdd::New() {
    return boost::shared_ptr<VirtualSwitchPortGroupAdd>(new VirtualSwitchPortGroupAdd());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchPortGroupAdd::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> portGroupName =
        Plinth::CallSpec::ParameterSpec::New("portgroup-name", Plinth::CallSpec::PARAMETER_STRING);
    portGroupName->SetRequired(true);
    portGroupName->SetShortName("p");
    portGroupName->SetDescription("The name of the port group to add");
    inputSpec->AddParameter(portGroupName);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vswitchName =
        Plinth::CallSpec::ParameterSpec::New("vswitch-name", Plinth::CallSpec::PARAMETER_STRING);
    vswitchName->SetRequired(true);
    vswitchName->SetShortName("v");
    vswitchName->SetDescription("The virtual switch to add the port group to.");
    inputSpec->AddParameter(vswitchName);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchPortGroupAdd::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void VirtualSwitchPortGroupAdd::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                                boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Gantry::Network::VirtualSwitch* vswitch = nullptr;
    try {
        std::string portGroupName = input->GetString("portgroup-name");
        std::string vswitchName = input->GetString("vswitch-name");
        vswitch = Gantry::Network::NetworkFactory::GetVirtualSwitchById(vswitchName);
        Gantry::Network::PortGroup* portGroup = vswitch->AddPortGroup(portGroupName);
        delete portGroup;
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
        delete vswitch;
    } catch (Gantry::Lib::GantryException& e) {
        delete vswitch;
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
