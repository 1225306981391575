#include "IpInterfaceIpv6Set.h"

#include <memory>

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "gantry/network/IpConfig.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface to set IPv6 settings for. This name must be an "
                      "interface listed in the interface list command.")
        .Required();
const Parameter kEnableDhcpv6 =
    Parameter::Bool("enable-dhcpv6", "d",
                    "Setting this value to true will enable DHCPv6 on this interface and attempt to aquire an IPv6 "
                    "address from the network");
const Parameter kEnableRouterAdv =
    Parameter::Bool("enable-router-adv", "r",
                    "Setting this value to true will enable IPv6 Router Advertised IPv6 addresses to be added to this "
                    "interface from any routers broadcasting on the local network.");
const Parameter kPeerDns = Parameter::Bool(
    "peer-dns", "P",
    "A boolean value to indicate if the system should use the DNS settings published via DHCPv6 for this interface.");

}  // namespace

IpInterfaceIpv6Set::IpInterfaceIpv6Set() {
    SetDescription("Configure IPv6 settings for a given Tessel network interface.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceIpv6Set::GetInputSpecInternal() {
    return InputSpecOf(kInterfaceName, kEnableDhcpv6, kEnableRouterAdv, kPeerDns);
}

boost::shared_ptr<OutputSpec> IpInterfaceIpv6Set::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpInterfaceIpv6Set::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    std::string name = input->GetString(kInterfaceName);
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        std::unique_ptr<Gantry::Network::TslNic> nic = FindInterface(nicInfo, *output, name);
        if (!nic) return;
        Gantry::Network::IpConfig config = nic->GetIpConfig();
        // The DNS flag goes back as configured, unless --peer-dns changes it.
        config.SetDhcpDns(nic->GetConfiguredIpConfig().GetDhcpDns());
        if (input->HasParameter(kEnableDhcpv6)) config.SetUseIpv6Dhcp(input->GetBool(kEnableDhcpv6));
        if (input->HasParameter(kPeerDns)) config.SetDhcpDns(input->GetBool(kPeerDns));
        if (input->HasParameter(kEnableRouterAdv)) config.SetUseIpv6RouterAdvertised(input->GetBool(kEnableRouterAdv));
        nic->SetIpConfig(config);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Error changing IPv6 configuration for the interface " + name +
                         ". Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
