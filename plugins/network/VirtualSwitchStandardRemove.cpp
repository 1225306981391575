#include "VirtualSwitchStandardRemove.h"

#include "gantry/lib/GantryException.h"
#include "plinth/callspec/Input.h"
#include "plinth/callspec/InputSpec.h"
#include "plinth/callspec/Output.h"
#include "plinth/callspec/OutputSpec.h"
#include "plinth/callspec/ParameterSpec.h"
#include "plinth/metaobj/MetaBool.h"
#include "trellis/network/PortsetImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

VirtualSwitchStandardRemove::VirtualSwitchStandardRemove() {
    SetDescription("Remove a virtual switch from the Halden networking system.");
    SetMetaDataField("type", "operation");
}

VirtualSwitchStandardRemove::~VirtualSwitchStandardRemove() {}

boost::shared_ptr<VirtualSwitchStandardRemove> VirtualSwitchStandardRemove::New() {
    return boost::shared_ptr<VirtualSwitchStandardRemove>(new VirtualSwitchStandardRemove());
}

boost::shared_ptr<Plinth::CallSpec::InputSpec> VirtualSwitchStandardRemove::GetInputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::InputSpec> inputSpec = Plinth::CallSpec::InputSpec::New();

    boost::shared_ptr<Plinth::CallSpec::ParameterSpec> vswitchName =
        Plinth::CallSpec::ParameterSpec::New("vswitch-name", Plinth::CallSpec::PARAMETER_STRING);
    vswitchName->SetRequired(true);
    vswitchName->SetShortName("v");
    vswitchName->SetDescription("The name of the virtual switch to remove.");
    inputSpec->AddParameter(vswitchName);

    return inputSpec;
}

boost::shared_ptr<Plinth::CallSpec::OutputSpec> VirtualSwitchStandardRemove::GetOutputSpecInternal() {
    boost::shared_ptr<Plinth::CallSpec::OutputSpec> outputSpec = Plinth::CallSpec::OutputSpec::New();
    outputSpec->SetResultType(Plinth::MetaObj::MetaBool::New());
    return outputSpec;
}

void VirtualSwitchStandardRemove::ExecuteInternal(boost::shared_ptr<Plinth::CallSpec::Input> input,
                                                  boost::shared_ptr<Plinth::CallSpec::Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString("vswitch-name");
        if (!Trellis::Network::PortsetImpl::IsValidVirtualSwitch(name)) {
            output->SetError("Unable to find virtual switch with the name " + name);
            return;
        }
        vswitchInfo.RemoveVirtualSwitch(name);
        output->SetResult(Plinth::MetaObj::MetaBool::New(true));
        output->Finish();
    } catch (Gantry::Lib::GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
