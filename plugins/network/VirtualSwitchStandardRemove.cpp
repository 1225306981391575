#include "VirtualSwitchStandardRemove.h"

#include "CommandSupport.h"
#include "trellis/network/PortsetImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kVswitchName =
    Parameter::String("vswitch-name", "v", "The name of the virtual switch to remove.").Required();

}  // namespace

VirtualSwitchStandardRemove::VirtualSwitchStandardRemove() {
    SetDescription("Remove a virtual switch from the Halden networking system.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardRemove::GetInputSpecInternal() { return InputSpecOf(kVswitchName); }

boost::shared_ptr<OutputSpec> VirtualSwitchStandardRemove::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchStandardRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVswitchName);
        if (!Trellis::Network::PortsetImpl::IsValidVirtualSwitch(name)) {
            output->SetError("Unable to find virtual switch with the name " + name);
            return;
        }
        vswitchInfo.RemoveVirtualSwitch(name);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
