#include "VirtualSwitchStandardUplinkRemove.h"

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

VirtualSwitchStandardUplinkRemove::VirtualSwitchStandardUplinkRemove() {
    SetDescription(
        "Remove an uplink from the given virtual switch. Note if this virtual switch has a NIC teaming policy "
        "assigned to it then the policy must also be modified to disable use of this uplink on this virtual "
        "switch");
    SetMetaDataField("type", "operation");
}

VirtualSwitchStandardUplinkRemove::~VirtualSwitchStandardUplinkRemove() {}

boost::shared_ptr<VirtualSwitchStandardUplinkRemove> VirtualSwitchStandardUplinkRemove::New() {
    return boost::shared_ptr<VirtualSwitchStandardUplinkRemove>(new VirtualSwitchStandardUplinkRemove());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchStandardUplinkRemove::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vswitchName =
        Plinth::CallSpec::ParameterSpec::New("vswitch-name", Plinth::CallSpec::PARAMETER_STRING);
    vswitchName->SetRequired(true);
    vswitchName->SetShortName("v");
    vswitchName->SetDescription("The name of the virtual switch to remove an uplink from.");
    inputSpec->AddParameter(vswitchName);

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> uplinkName =
        Plinth::CallSpec::ParameterSpec::New("uplink-name", Plinth::CallSpec::PARAMETER_STRING);
    uplinkName->SetRequired(true);
    uplinkName->SetShortName("u");
    uplinkName->SetDescription("The name of the uplink to remove from the virtual switch.");
    inputSpec->AddParameter(uplinkName);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchStandardUplinkRemove::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void VirtualSwitchStandardUplinkRemove::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                                        boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Gantry::Network::VirtualSwitch* vswitch = nullptr;
    try {
        std::string vswitchName = input->GetString("vswitch-name");
        std::string uplinkName = input->GetString("uplink-name");
        vswitch = Gantry::Network::NetworkFactory::GetVirtualSwitchById(vswitchName);
        vswitch->RemoveUplink(uplinkName);
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
