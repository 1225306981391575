#include "VirtualSwitchPortGroupRemove.h"

#include "gantry/lib/GantryException.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/VirtualSwitch.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchPortGroupRemove::VirtualSwitchPortGroupRemove() {
    SetDescription("Remove a port group from the given virtual switch");
    SetMetaDataField("type", "operation");
}

VirtualSwitchPortGroupRemove::~VirtualSwitchPortGroupRemove() {}

boost::shared_ptr<VirtualSwitchPortGroupRemove> VirtualSwitchPortGroupRemove::New() {
    return boost::shared_ptr<VirtualSwitchPortGroupRemove>(new VirtualSwitchPortGroupRemove());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchPortGroupRemove::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> portGroupName =
        Plinth::CallSpec::ParameterSpec::New("portgroup-name", Plinth::CallSpec::PARAMETER_STRING);
    portGroupName->SetRequired(true);
    portGroupName->SetShortName("p");
    portGroupName->SetDescription(" ");
    inputSpec->AddParameter(portGroupName);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vswitchName =
        Plinth::CallSpec::ParameterSpec::New("vswitch-name", Plinth::CallSpec::PARAMETER_STRING);
    vswitchName->SetRequired(true);
    vswitchName->SetShortName("v");
    vswitchName->SetDescription(" ");
    inputSpec->AddParameter(vswitchName);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchPortGroupRemove::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void VirtualSwitchPortGroupRemove::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                                   boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Gantry::Network::VirtualSwitch* vswitch = nullptr;
    try {
        std::string portGroupName = input->GetString("portgroup-name");
        std::string vswitchName = input->GetString("vswitch-name");
        vswitch = Gantry::Network::NetworkFactory::GetVirtualSwitchById(vswitchName);
        vswitch->RemovePortGroup(portGroupName);
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
