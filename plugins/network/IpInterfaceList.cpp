#include "IpInterfaceList.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/ConnectionPoint.h"
#include "gantry/network/DVSwitch.h"
#include "gantry/network/Port.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/TesselNicInfoImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Network::ConnectionPoint;

namespace {

const Parameter kNetstack = Parameter::String(
    "netstack", "N", "The network stack instance; if unspecified, consider all netstack instances");

// Where a kind of connection point has nothing to show.
const char* const kNone = "N/A";

// The fields of the place an interface is attached, with no value: as a
// detached interface shows them, and where each kind starts.
void SetUnattached(MetaStruct& entry) {
    entry.SetField("Portgroup", kNone);
    entry.SetField("Netstack Instance", kNone);
    entry.SetField("VDS Name", kNone);
    entry.SetField("VDS UUID", kNone);
    entry.SetField("VDS Port", kNone);
    entry.SetField("VDS Connection", -1);
    entry.SetField("Opaque Network ID", kNone);
    entry.SetField("Opaque Network Type", kNone);
    entry.SetField("External ID", kNone);
}

// The fields of a DVPort; a switch that cannot be reached is reported and
// leaves its name unset.
void SetDVPort(MetaStruct& entry, Gantry::Network::DVPortParam const& param, std::string const& portsetName,
               Output& output) {
    entry.SetField("VDS UUID", param.dvsId);
    entry.SetField("VDS Port", param.portId);
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    std::unique_ptr<Gantry::Network::DVSwitch> dvSwitch(vswitchInfo.GetDVSwitchByName(portsetName));
    if (dvSwitch) {
        entry.SetField("VDS Name", dvSwitch->GetName());
    } else {
        output.SetError("Unable to access the associated VDS");
    }
    entry.SetField("VDS Connection", static_cast<long long>(param.connectionId));
}

// The fields of the place the interface is attached. Reports a kind it does
// not know and leaves the fields unset.
void SetConnectionPoint(MetaStruct& entry, Gantry::Network::TslNic& nic, ConnectionPoint& point, Output& output) {
    std::string portsetName = point.GetPortsetName();
    entry.SetField("Portset", portsetName.empty() ? kNone : portsetName);
    switch (point.GetType()) {
    case ConnectionPoint::TYPE_PORTGROUP:
        SetUnattached(entry);
        entry.SetField("Portgroup", point.GetPortGroupName());
        entry.SetField("Netstack Instance", nic.GetNetstackInstanceKey());
        break;
    case ConnectionPoint::TYPE_DVPORT: {
        Gantry::Network::DVPortParam param = point.GetDVPortParam();
        SetUnattached(entry);
        entry.SetField("Netstack Instance", nic.GetNetstackInstanceKey());
        SetDVPort(entry, param, portsetName, output);
        break;
    }
    case ConnectionPoint::TYPE_OPAQUE_NETWORK: {
        Gantry::Network::OpaqueNetworkParam param = point.GetOpaqueNetworkParam();
        SetUnattached(entry);
        entry.SetField("Netstack Instance", nic.GetNetstackInstanceKey());
        entry.SetField("Opaque Network ID", param.networkId);
        entry.SetField("Opaque Network Type", param.networkType);
        entry.SetField("External ID", param.externalId);
        break;
    }
    default:
        output.SetError("Unknown ConnectionPoint type found in list of Tessel network interfaces.");
    }
}

}  // namespace

IpInterfaceList::IpInterfaceList() {
    SetDescription("This command will list the Tessel network interfaces currently known to the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:NetworkInterface", "%Name%");
    SetDefaultOutputParameter("fields:NetworkInterface",
                              "Name,MAC Address,Enabled,Portset,Portgroup,Netstack Instance,VDS Name,VDS UUID,"
                              "VDS Port,VDS Connection,Opaque Network ID,Opaque Network Type,External ID,MTU,"
                              "TSO MSS,Port ID");
}

boost::shared_ptr<InputSpec> IpInterfaceList::GetInputSpecInternal() { return InputSpecOf(kNetstack); }

boost::shared_ptr<OutputSpec> IpInterfaceList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpInterfaceList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NetworkInterface");
    result->SetField("Name", MetaString::New());
    result->SetField("MAC Address", MetaString::New());
    result->SetField("Portset", MetaString::New());
    result->SetField("Portgroup", MetaString::New());
    result->SetField("Netstack Instance", MetaString::New());
    result->SetField("VDS Name", MetaString::New());
    result->SetField("VDS UUID", MetaString::New());
    result->SetField("VDS Port", MetaString::New());
    result->SetField("VDS Connection", MetaInt::New());
    result->SetField("Opaque Network ID", MetaString::New());
    result->SetField("Opaque Network Type", MetaString::New());
    result->SetField("External ID", MetaString::New());
    result->SetField("MTU", MetaInt::New());
    result->SetField("TSO MSS", MetaInt::New());
    result->SetField("Enabled", MetaBool::New());
    result->SetField("Port ID", MetaInt::New());
    return result;
}

void IpInterfaceList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        std::string netstack = input->GetString(kNetstack);
        OwnedVector<Gantry::Network::TslNic> nics(netstack.empty() ? nicInfo.GetTesselNics()
                                                                   : nicInfo.GetTesselNicsByInstanceKey(netstack));
        for (Gantry::Network::TslNic* nic : nics) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Name", nic->GetName());
            entry->SetField("MAC Address", nic->GetMacAddress().GetStringAddress());
            std::unique_ptr<ConnectionPoint> point(nic->GetConnectionPoint());
            if (point) {
                SetConnectionPoint(*entry, *nic, *point, *output);
            } else {
                // Detached: its netstack is not shown either.
                entry->SetField("Portset", kNone);
                SetUnattached(*entry);
            }
            entry->SetField("MTU", nic->GetMtu());
            entry->SetField("TSO MSS", nic->GetTsoMss());
            entry->SetField("Enabled", nic->IsEnabled());
            std::unique_ptr<Gantry::Network::Port> port(nic->GetPort());
            if (port) entry->SetField("Port ID", port->GetPortId());
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
