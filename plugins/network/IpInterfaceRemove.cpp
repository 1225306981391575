#include "IpInterfaceRemove.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "InterfaceConnectionPoint.h"
#include "InterfaceLookup.h"
#include "Netstacks.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNetstack = Parameter::String(
    "netstack", "N", "The network stack instance; if unspecified, use the default netstack instance");
const Parameter kPortGroupName = Parameter::String(
    "portgroup-name", "p", "The name of the vswitch port group to delete this Tessel network interface from.");
const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface to remove. This name must be in the form tslX, "
                      "where X is a number 0-255")
        .Regex(kInterfaceNamePattern);

const char* const kTwoWays =
    "A Tessel network interface can be uniquely specified by --interface-name or --portgroup-name or "
    "--dvs-name/--dvport-id. i.e. Providing its name or its connection point are two ways to uniquely specify a "
    "Tessel network interface.";

}  // namespace

IpInterfaceRemove::IpInterfaceRemove() {
    SetDescription(
        "Remove a Tessel network interface from the Halden host. A Tessel network interface can be uniquely "
        "specified by --interface-name or --portgroup-name or --dvs-name/--dvport-id. i.e. Providing its name or its "
        "connection point are two ways to uniquely specify a Tessel network interface.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceRemove::GetInputSpecInternal() {
    return InputSpecOf(kNetstack, kPortGroupName, kInterfaceDvsName, kInterfaceDvPortId, kInterfaceName);
}

boost::shared_ptr<OutputSpec> IpInterfaceRemove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpInterfaceRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    bool byName = input->HasParameter(kInterfaceName);
    bool byPoint = input->HasParameter(kPortGroupName) || input->HasParameter(kInterfaceDvsName) ||
                   input->HasParameter(kInterfaceDvPortId);
    if (byName == byPoint) {
        output->SetError(std::string("Please correctly and uniquely specify a way to remove it. ") + kTwoWays);
        return;
    }
    std::unique_ptr<Gantry::Network::ConnectionPoint> point;
    if (byPoint) {
        if (!NamesOneConnectionPoint(*input, *output, kPortGroupName)) return;
        point = MakeConnectionPoint(*input, *output, kPortGroupName);
        if (!point) return;
    }
    try {
        Trellis::Network::TesselNicInfoImpl nicInfo;
        if (byName) {
            // Sought in every netstack: --netstack plays no part here.
            std::string name = input->GetString(kInterfaceName);
            OwnedVector<Gantry::Network::TslNic> nics(nicInfo.GetTesselNics());
            Gantry::Network::TslNic* nic = InterfaceNamed(nics, name);
            if (nic != nullptr) {
                nic->Remove();
            } else {
                output->SetError("Unable to find Tessel network interface with the name " + name);
            }
            output->SetResult(MetaBool::New(nic != nullptr));
            output->Finish();
            return;
        }
        std::string netstack = input->GetString(kNetstack);
        nicInfo.RemoveTesselNic(point.get(), netstack.empty() ? kDefaultNetstack : netstack);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to remove Tessel network interface. Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
