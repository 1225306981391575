#include "IpIpsecSPAdd.h"

#include <string>

#include "CommandSupport.h"
#include "IpsecValues.h"
#include "gantry/network/IpSec.h"
#include "gantry/network/Ipv6Network.h"
#include "trellis/network/IpSecConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kName = Parameter::String("sp-name", "n", "Name for the Security Policy to be added.").Required();
const Parameter kSaName = Parameter::String(
    "sa-name", "a",
    "Name for the Security Association. Not being Specified lets tessel automatically choose an Security "
    "Association. If no applicable Security Association exists, then tessel may request one using IKE.");
const Parameter kSource =
    Parameter::String("sp-source", "s",
                      "Ipv6 address and prefix length of Security Policy source. Can be specified as 'any' or a "
                      "correct IPv6 network address.")
        .Required();
const Parameter kDestination =
    Parameter::String("sp-destination", "d",
                      "Ipv6 address and prefix length of Security Policy destination. Can be specified as 'any' or a "
                      "correct Ipv6 network address.")
        .Required();
constexpr Parameter::Word kModeWords[] = {{"transport", ""}, {"tunnel", ""}};
const Parameter kMode = Parameter::String("sp-mode", "m", "Security Policy mode. Should be one in set %ENUM%.")
                            .StringEnum(kModeWords);
const Parameter kSourcePort =
    Parameter::Int("source-port", "p", "Source Port for Security Policy. '0' stands for 'any'").Required();
const Parameter kDestinationPort =
    Parameter::Int("destination-port", "P", "Destination Port for Security Policy. '0' stands for 'any'").Required();
constexpr Parameter::Word kActionWords[] = {{"none", ""}, {"discard", ""}, {"ipsec", ""}};
const Parameter kAction = Parameter::String("action", "A", "Action for Security Policy. Should be one in set %ENUM%.")
                              .StringEnum(kActionWords);
constexpr Parameter::Word kProtocolWords[] = {{"any", ""}, {"tcp", ""}, {"udp", ""}, {"icmp6", ""}};
const Parameter kProtocol =
    Parameter::String("upper-layer-protocol", "u",
                      "Upper layer protocol for Security Policy, Should be one in set %ENUM%.")
        .StringEnum(kProtocolWords);
constexpr Parameter::Word kDirectionWords[] = {{"in", ""}, {"out", ""}};
const Parameter kDirection =
    Parameter::String("flow-direction", "w", "Flow direction for Security Policy. Should be one in set %ENUM%.")
        .StringEnum(kDirectionWords);

// The action under which a policy has a mode and an association.
const char* const kIpsecAction = "ipsec";

// "any" leaves the address at "::" with prefix length 0; any other text must
// be an IPv6 network.
void SetNetwork(std::string const& text, Gantry::Network::Ipv6Address& address, unsigned int& prefixLength) {
    if (text == kAnyAddress) return;
    Gantry::Network::Ipv6Network network(text);
    address = network.GetAddress();
    prefixLength = network.GetNetmask();
}

}  // namespace

IpIpsecSPAdd::IpIpsecSPAdd() {
    SetDescription("Add a Security Policy.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpIpsecSPAdd::GetInputSpecInternal() {
    return InputSpecOf(kName, kSaName, kSource, kDestination, kMode, kSourcePort, kDestinationPort, kAction,
                       kProtocol, kDirection);
}

boost::shared_ptr<OutputSpec> IpIpsecSPAdd::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpIpsecSPAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::IpSecConfigImpl ipsecConfig;
    try {
        // Both addresses start at "::" with prefix length 0.
        Gantry::Network::IpSecSpdParam param;
        // An option left out reads as "", which maps to its default.
        std::string saName = input->GetString(kSaName);
        param.srcPort = input->GetInt(kSourcePort);
        param.dstPort = input->GetInt(kDestinationPort);
        SetNetwork(input->GetString(kSource), param.srcAddress, param.srcPrefixLength);
        SetNetwork(input->GetString(kDestination), param.dstAddress, param.dstPrefixLength);
        std::string mode = input->GetString(kMode);
        std::string protocol = input->GetString(kProtocol);
        std::string direction = input->GetString(kDirection);
        std::string action = input->GetString(kAction);
        param.protocol = ipsecConfig.StringToIpSecULProtoType(protocol);
        param.direction = ipsecConfig.StringToIpSecDirection(direction);
        param.action = ipsecConfig.StringToIpSecAction(action);
        // Only an ipsec policy keeps a mode and an association, whatever was given.
        if (action == kIpsecAction) {
            param.mode = ipsecConfig.StringToIpSecMode(mode);
            param.saName = saName;
        }
        param.name = input->GetString(kName);
        ipsecConfig.AddSPDConfig(param);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
