#include "IpInterfaceSet.h"

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kInterfaceName =
    Parameter::String("interface-name", "i", "The name of the interface to apply the configurations.").Required();
const Parameter kEnabled =
    Parameter::Bool("enabled", "e", "Set to true to enable the interface, set to false to disable it.");
// No range here, unlike add's: the command refuses a negative value itself.
const Parameter kMtu = Parameter::Int("mtu", "m", "The MTU size of the IP interface.");

}  // namespace

IpInterfaceSet::IpInterfaceSet() {
    SetDescription("This command sets the enabled status and MTU size of a given IP interface ");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceSet::GetInputSpecInternal() {
    return InputSpecOf(kInterfaceName, kEnabled, kMtu);
}

boost::shared_ptr<OutputSpec> IpInterfaceSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpInterfaceSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        std::string name = input->GetString(kInterfaceName);
        OwnedVector<Gantry::Network::TslNic> nics(nicInfo.GetTesselNics());
        Gantry::Network::TslNic* nic = InterfaceNamed(nics, name);
        if (nic == nullptr) {
            output->SetError("Unable to find an interface with name " + name);
            return;
        }
        if (input->HasParameter(kEnabled)) {
            if (input->GetBool(kEnabled)) {
                nic->Enable();
            } else {
                nic->Disable();
            }
        }
        if (input->HasParameter(kMtu)) {
            int mtu = input->GetInt(kMtu);
            // What --enabled changed stays changed.
            if (mtu < 0) {
                output->SetError("MTU size should be a positive value");
                return;
            }
            nic->SetMtu(mtu);
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
