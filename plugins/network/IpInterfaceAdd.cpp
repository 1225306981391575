#include "IpInterfaceAdd.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "InterfaceConnectionPoint.h"
#include "InterfaceLookup.h"
#include "Netstacks.h"
#include "gantry/network/IpConfig.h"
#include "gantry/network/MacAddress.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/TesselNicInfoImpl.h"
#include "trellis/util/Exec.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Network::TslNic;
using Gantry::Network::TslNicTagType;

namespace {

const Parameter kNetstack = Parameter::String(
    "netstack", "N", "The network stack instance; if unspecified, use the default netstack instance");
const Parameter kPortGroupName = Parameter::String(
    "portgroup-name", "p", "The name of the vswitch port group to add this Tessel network interface to.");
const Parameter kMtu =
    Parameter::Int("mtu", "m", "Set the MTU setting for a given Tessel network interface on creation")
        .Range(TslNic::MIN_MTU, TslNic::MAX_MTU);
const Parameter kMacAddress = Parameter::String(
    "mac-address", "M", "Set the MAC address for the newly created Tessel network interface.");
const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface to create. This name must be in the form tslX, "
                      "where X is a number 0-255")
        .Regex(kInterfaceNamePattern);

}  // namespace

// Makes the new interface, which is on a dedicated stack, hold the stack's
// tag in place of the interfaces of the default stack; interfaces of other
// stacks keep it. Host failures are thrown.
static void AutoTagInterfaceOnDedicatedStack(TslNic* nic, TslNicTagType tag) {
    Trellis::Network::TesselNicInfoImpl nicInfo;
    nic->AddTag(tag, false);
    OwnedVector<TslNic> holders(nicInfo.GetTesselNicsByTag(tag));
    for (TslNic* holder : holders)
        if (holder->GetNetstackInstanceKey() == kDefaultNetstack) holder->RemoveTag(tag);
}

IpInterfaceAdd::IpInterfaceAdd() {
    SetDescription("Add a new Tessel network interface.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceAdd::GetInputSpecInternal() {
    return InputSpecOf(kNetstack, kPortGroupName, kInterfaceDvsName, kInterfaceDvPortId, kMtu, kMacAddress,
                       kInterfaceName);
}

boost::shared_ptr<OutputSpec> IpInterfaceAdd::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpInterfaceAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    if (!NamesOneConnectionPoint(*input, *output, kPortGroupName)) return;
    Gantry::Network::MacAddress mac;  // unset: the host assigns one
    if (input->HasParameter(kMacAddress)) {
        std::string text = input->GetString(kMacAddress);
        if (!Gantry::Network::MacAddress::IsValid(text)) {
            output->SetError("Invalid unicast MAC address specified.");
            return;
        }
        mac = Gantry::Network::MacAddress(text);
    }
    unsigned int mtu = input->GetInt(kMtu);            // 0 when not given: the host's default
    std::string name = input->GetString(kInterfaceName);  // "" when not given: the next free name
    std::unique_ptr<Gantry::Network::ConnectionPoint> point = MakeConnectionPoint(*input, *output, kPortGroupName);
    if (!point) return;
    try {
        Trellis::Network::TesselNicInfoImpl nicInfo;
        // Given empty, the empty key goes to the host as it is.
        std::string netstack = input->HasParameter(kNetstack) ? input->GetString(kNetstack) : kDefaultNetstack;
        std::unique_ptr<TslNic> nic(
            nicInfo.AddTesselNic(point.get(), netstack, Gantry::Network::IpConfig(), mac, 0, mtu, name));
        TslNicTagType tag = TagOfDedicatedStack(netstack);
        if (tag != Gantry::Network::TSLNIC_TAG_INVALID) AutoTagInterfaceOnDedicatedStack(nic.get(), tag);
        // A daemon that does not start is reported; the new interface stays,
        // tagged, and is activated all the same.
        if (tag == Gantry::Network::TSLNIC_TAG_PROVISIONING &&
            Trellis::Util::Trellis_Exec("/etc/init.d/xfrd restart", false, true, false) != 0)
            output->SetError("Unable to start the XFR daemon. Take a look at /var/log/xfrd.log for more information.");
        nic->Activate();
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        // An interface already created stays on the host.
        output->SetError("Unable to add Tessel network interface. Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
