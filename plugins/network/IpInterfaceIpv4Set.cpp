#include "IpInterfaceIpv4Set.h"

#include <memory>

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "gantry/network/IpConfig.h"
#include "gantry/network/Ipv4Address.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Network::Ipv4Address;

namespace {

const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface to set IPv4 settings for. This name must be an "
                      "interface listed in the interface list command.")
        .Required();
constexpr Parameter::Word kTypeWords[] = {
    {"static", "Set Static IPv4 information for this interface. Requires --ipv4 and --netmask options."},
    {"dhcp", "Use DHCP to aquire IPv4 setting for this interface."},
    {"none", "Remove IPv4 settings form this interface."}};
const Parameter kType =
    Parameter::String("type", "t", "IPv4 Address type : %FULLENUM%")
        .Required()
        .StringEnum(kTypeWords);
const Parameter kIpv4 = Parameter::String("ipv4", "I", "The static IPv4 address for this interface.");
const Parameter kNetmask = Parameter::String("netmask", "N", "The static IPv4 netmask for this interface.");
const Parameter kPeerDns = Parameter::Bool(
    "peer-dns", "P",
    "A boolean value to indicate if the system should use the DNS settings published via DHCP for this interface.");

// Sets the static address and netmask of the options. Reports each fault of
// the options, all of them, and then gives false with nothing set.
bool SetStatic(Input& input, Output& output, Gantry::Network::IpConfig& config) {
    std::string ipv4 = input.GetString(kIpv4);
    std::string netmask = input.GetString(kNetmask);
    bool valid = true;
    if (ipv4.empty() || netmask.empty()) {
        output.SetError("The --type=static requires the --ipv4 and --netmask options.");
        valid = false;
    }
    if (!Ipv4Address::IsValidAddress(ipv4)) {
        output.SetError("Invalid --ipv4 option provided. This address is not a valid IPv4 address");
        valid = false;
    }
    if (!Ipv4Address::IsValidAddress(netmask)) {
        output.SetError("Invalid --netmask option provided. This address is not a valid IPv4 address");
        valid = false;
    }
    if (!valid) return false;
    config.SetIpv4Address(Ipv4Address(ipv4));
    config.SetIpv4Netmask(Ipv4Address(netmask));
    return true;
}

}  // namespace

IpInterfaceIpv4Set::IpInterfaceIpv4Set() {
    SetDescription("Configure IPv4 setting for a given Tessel network interface.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceIpv4Set::GetInputSpecInternal() {
    return InputSpecOf(kInterfaceName, kType, kIpv4, kNetmask, kPeerDns);
}

boost::shared_ptr<OutputSpec> IpInterfaceIpv4Set::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpInterfaceIpv4Set::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    std::string name = input->GetString(kInterfaceName);
    std::string type = input->GetString(kType);
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        std::unique_ptr<Gantry::Network::TslNic> nic = FindInterface(nicInfo, *output, name);
        if (!nic) return;
        // What the command does not touch stays as it is in force.
        Gantry::Network::IpConfig config = nic->GetIpConfig();
        if (type == "static") {
            if (!SetStatic(*input, *output, config)) return;
        } else if (type == "dhcp") {
            config.SetUseDhcp(true);
            // Only DHCP hands out name servers: --peer-dns counts here alone.
            if (input->HasParameter(kPeerDns)) config.SetDhcpDns(input->GetBool(kPeerDns));
        } else if (type == "none") {
            config.SetIpv4UseNone();
        }
        nic->SetIpConfig(config);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Error changing IPv4 configuration for the interface " + name +
                         ". Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
