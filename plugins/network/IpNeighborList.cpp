#include "IpNeighborList.h"

#include <string>
#include <vector>

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "Netstacks.h"
#include "RoutingNetstack.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/RoutingInfoImpl.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

constexpr const char* kAllVersions = "all";

constexpr Parameter::Word kVersionWords[] = {{"4", ""}, {"6", ""}, {kAllVersions, ""}};
const Parameter kVersion = Parameter::String("version", "v", "IP version : %ENUM%").StringEnum(kVersionWords);
const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface to limit the output of this command to; if "
                      "unspecified, list neighbors on all interfaces.");

}  // namespace

IpNeighborList::IpNeighborList() {
    SetDescription("List ARP table entries");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:NetworkNeighbor", "Neighbor,Mac Address,Tslnic,Expiry,State,Type");
    SetDefaultOutputParameter("units:NetworkNeighbor.Expiry", "sec");
}

boost::shared_ptr<InputSpec> IpNeighborList::GetInputSpecInternal() {
    return InputSpecOf(kVersion, kRoutingNetstack, kInterfaceName);
}

boost::shared_ptr<OutputSpec> IpNeighborList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpNeighborList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NetworkNeighbor");
    result->SetField("Neighbor", MetaString::New());
    result->SetField("Mac Address", MetaString::New());
    result->SetField("Tslnic", MetaString::New());
    result->SetField("Expiry", MetaInt::New());
    result->SetField("State", MetaString::New());
    result->SetField("Type", MetaString::New());
    return result;
}

// No guarded block: a failure of the host leaves the command, for the tool to
// report.
void IpNeighborList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::TesselNicInfoImpl nicInfo;
    boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
    std::string interfaceName = input->GetString(kInterfaceName);
    Trellis::Network::RoutingInfoImpl routing(kDefaultNetstack);
    Trellis::Network::NetworkInfoImpl networkInfo;
    ChooseNetstack(routing, *input);
    std::string version = input->HasParameter(kVersion) ? input->GetString(kVersion) : kAllVersions;

    // Only proves that the interface exists: the table read is still the
    // chosen netstack's, filtered by the name.
    if (!interfaceName.empty() && !FindInterface(nicInfo, *output, interfaceName)) return;

    if (version == "4" || version == kAllVersions) {
        std::vector<Gantry::Network::Ipv4Neighbor> neighbors;
        routing.GetCurrentIpv4TesselNeighbors(neighbors, interfaceName);
        for (Gantry::Network::Ipv4Neighbor const& neighbor : neighbors) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Neighbor", neighbor.address.GetStringAddress());
            entry->SetField("Mac Address", neighbor.macAddress);
            entry->SetField("Tslnic", neighbor.interfaceName);
            entry->SetField("Expiry", neighbor.expiry);
            entry->SetField("State", "");
            entry->SetField("Type", routing.GetIpv4NeighborType(neighbor));
            result->AddMetaStruct(entry);
        }
    }
    // Without IPv6 in the host's kernel, version 6 lists nothing.
    if ((version == "6" || version == kAllVersions) && networkInfo.IsTslIpv6Enabled()) {
        std::vector<Gantry::Network::Ipv6Neighbor> neighbors;
        routing.GetCurrentIpv6TesselNeighbors(neighbors, interfaceName);
        for (Gantry::Network::Ipv6Neighbor const& neighbor : neighbors) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Neighbor", neighbor.address.GetStringAddress());
            entry->SetField("Mac Address", neighbor.macAddress);
            entry->SetField("Tslnic", neighbor.interfaceName);
            entry->SetField("Expiry", neighbor.expiry);
            entry->SetField("State", routing.GetIpv6NeighborState(neighbor));
            entry->SetField("Type", routing.GetIpv6NeighborType(neighbor));
            result->AddMetaStruct(entry);
        }
    }
    output->SetResult(result);
    output->Finish();
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
