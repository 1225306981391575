#include "VirtualSwitchStandardSet.h"

#include "CommandSupport.h"
#include "gantry/network/CdpStatus.h"
#include "gantry/network/VirtualSwitch.h"
#include "trellis/network/PortsetImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::CdpStatus;

const Parameter kVswitchName =
    Parameter::String("vswitch-name", "v", "The name of virtual switch to apply the configurations.").Required();
const Parameter kMtu = Parameter::Int("mtu", "m", "The MTU size of the given virtual switch.");
constexpr Parameter::Word kCdpStatusWords[] = {
    {"down", "CDP status is 'down'"},
    {"listen", "CDP status is 'listen'"},
    {"advertise", "CDP status is 'advertise'"},
    {"both", "CDP status is 'both'"}};
const Parameter kCdpStatus =
    Parameter::String("cdp-status", "c",
                      "The CDP status of the given virtual switch. It can be 'down', 'listen', 'advertise' or 'both'")
        .StringEnum(kCdpStatusWords);

// Any word but the first three means both; the constraint lets only "both" through.
CdpStatus CdpStatusOf(std::string const& word) {
    if (word == "down") return CdpStatus::Down;
    if (word == "listen") return CdpStatus::Listen;
    if (word == "advertise") return CdpStatus::Advertise;
    return CdpStatus::Both;
}

}  // namespace

VirtualSwitchStandardSet::VirtualSwitchStandardSet() {
    SetDescription("This command sets the MTU size and CDP status of a given virtual switch.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> VirtualSwitchStandardSet::GetInputSpecInternal() {
    return InputSpecOf(kVswitchName, kMtu, kCdpStatus);
}

boost::shared_ptr<OutputSpec> VirtualSwitchStandardSet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void VirtualSwitchStandardSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    try {
        std::string name = input->GetString(kVswitchName);
        if (!Trellis::Network::PortsetImpl::IsValidVirtualSwitch(name)) {
            output->SetError(name + " is not a valid name for a virtual switch");
            return;
        }
        std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch(vswitchInfo.GetVirtualSwitchByName(name));
        if (!vswitch) {
            output->SetError("Unable to find a virtual switch with name " + name);
            return;
        }
        if (input->HasParameter(kMtu)) {
            int mtu = input->GetInt(kMtu);
            if (mtu < 0) {
                output->SetError("MTU size should be a positive value");
                return;
            }
            vswitch->SetMtu(mtu);
        }
        if (input->HasParameter(kCdpStatus)) {
            vswitch->SetCdpStatus(CdpStatusOf(input->GetString(kCdpStatus)));
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
