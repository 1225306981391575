#include "Ipv6AddressChange.h"

#include <memory>

#include "InterfaceLookup.h"
#include "gantry/network/Ipv6Network.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

void ChangeIpv6Address(Input& input, Output& output, std::string const& interfaceOption, std::string const& ipv6Option,
                       void (Gantry::Network::IpConfig::*change)(Gantry::Network::Ipv6Network const&)) {
    std::string name = input.GetString(interfaceOption);
    std::string ipv6 = input.GetString(ipv6Option);
    if (!Gantry::Network::Ipv6Network::IsValidAddressAndNetmask(ipv6)) {
        output.SetError(
            "Invalid format for IPv6 address. Address must be in the format <ipv6-address>/<prefix-length>   "
            "Example: 1:2:3:4::/64");
        return;
    }
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        std::unique_ptr<Gantry::Network::TslNic> nic = FindInterface(nicInfo, output, name);
        if (!nic) return;
        Gantry::Network::IpConfig config = nic->GetIpConfig();
        (config.*change)(Gantry::Network::Ipv6Network(ipv6));
        nic->SetIpConfig(config);
        output.SetResult(MetaBool::New(true));
        output.Finish();
    } catch (GantryException& e) {
        // Removing says "adding" too.
        output.SetError("Error adding IPv6 address for the interface " + name + ". Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
