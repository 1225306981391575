#include "IpNeighborRemove.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "Netstacks.h"
#include "RoutingNetstack.h"
#include "gantry/network/TslNic.h"
#include "trellis/network/NetworkInfoImpl.h"
#include "trellis/network/RoutingInfoImpl.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

constexpr Parameter::Word kVersionWords[] = {{"4", ""}, {"6", ""}};
const Parameter kVersion = Parameter::String("version", "v", "IP version : %ENUM%").Required().StringEnum(kVersionWords);
const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface to remove the neighbor entry from. If not "
                      "specified, neighbor will be removed from all interfaces");
const Parameter kNeighborAddr =
    Parameter::String("neighbor-addr", "a", "The IPv4/IPv6 address of the neighbor.").Required();

}  // namespace

IpNeighborRemove::IpNeighborRemove() {
    SetDescription("Remove ARP table entries");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpNeighborRemove::GetInputSpecInternal() {
    return InputSpecOf(kVersion, kRoutingNetstack, kInterfaceName, kNeighborAddr);
}

boost::shared_ptr<OutputSpec> IpNeighborRemove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpNeighborRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        std::string interfaceName = input->GetString(kInterfaceName);
        std::string version = input->GetString(kVersion);
        Trellis::Network::RoutingInfoImpl routing(kDefaultNetstack);
        Trellis::Network::NetworkInfoImpl networkInfo;
        if (interfaceName.empty()) {
            ChooseNetstack(routing, *input);
        } else {
            // The interface's own netstack, whatever the netstack option says.
            std::unique_ptr<Gantry::Network::TslNic> nic = FindInterface(nicInfo, *output, interfaceName);
            if (!nic) return;
            routing.SetNetstackInstanceKey(nic->GetNetstackInstanceKey());
        }
        if (version == "4") {
            Gantry::Network::Ipv4Neighbor neighbor;
            neighbor.address = Gantry::Network::Ipv4Address(input->GetString(kNeighborAddr));
            neighbor.interfaceName = interfaceName;
            routing.RemoveIpv4Neighbor(neighbor);
        }
        // Without IPv6 in the host's kernel, nothing is removed.
        if (version == "6" && networkInfo.IsTslIpv6Enabled()) {
            Gantry::Network::Ipv6Neighbor neighbor;
            neighbor.address = Gantry::Network::Ipv6Address(input->GetString(kNeighborAddr));
            neighbor.interfaceName = interfaceName;
            routing.RemoveIpv6Neighbor(neighbor);
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
