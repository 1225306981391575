#include "IpIpsecSARemove.h"

#include <string>

#include "CommandSupport.h"
#include "IpsecValues.h"
#include "gantry/network/IpSec.h"
#include "trellis/network/IpSecConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kName = Parameter::String(
    "sa-name", "n", "Name for the Security Association to be removed. Specify 'auto' to remove an auto SA.");
const Parameter kRemoveAll = Parameter::Flag("remove-all", "a", "Set to remove all Security Associations.");
const Parameter kSource = Parameter::String(
    "sa-source", "s",
    "Ipv6 address of Security Association source. This option needs to be specified when removing an auto SA.");
const Parameter kDestination = Parameter::String(
    "sa-destination", "d",
    "Ipv6 address of Security Association destination. This option needs to be specified when removing an auto SA.");
const Parameter kSpi = Parameter::String(
    "sa-spi", "p",
    "SPI value for the Security Association (hex). This option needs to be specified when removing an auto SA");

// The name that picks an automatic association, which has none of its own.
const char* const kAutoName = "auto";

const char* const kWhichRemoval =
    "Can not figure out which operation you want to perform.\n"
    "Remove a unique SA: Only specify the '--sa-name' option to remove a normal SA.\n"
    "Remove an auto SA: Set the '--sa-name' to 'auto'. You should also specify '--sa-source', '--sa-destination' "
    "and '--sa-spi' and omit '--remove-all' when removing an auto SA.\n"
    "Remove all SAs: You should only set the flag '--remove-all' to remove all SAs.";

}  // namespace

IpIpsecSARemove::IpIpsecSARemove() {
    SetDescription("Operation to remove Security Association(s)");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpIpsecSARemove::GetInputSpecInternal() {
    return InputSpecOf(kName, kRemoveAll, kSource, kDestination, kSpi);
}

boost::shared_ptr<OutputSpec> IpIpsecSARemove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpIpsecSARemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::IpSecConfigImpl ipsecConfig;
    try {
        bool all = input->HasParameter(kRemoveAll);
        bool named = input->HasParameter(kName);
        bool source = input->HasParameter(kSource);
        bool destination = input->HasParameter(kDestination);
        bool spi = input->HasParameter(kSpi);
        std::string name = input->GetString(kName);
        bool automatic = named && name == kAutoName;
        if (all && !named && !source && !destination && !spi) {
            ipsecConfig.FlushSADConfig();
        } else if (named && !automatic && !all && !source && !destination && !spi) {
            ipsecConfig.RemoveSADConfig(name);
        } else if (automatic && source && destination && spi && !all) {
            // Unlike add: no "any", and an SPI the stream cannot read whole
            // is used as far as it was read.
            Gantry::Network::IpSecSadParam param;
            param.srcAddress = Gantry::Network::Ipv6Address(input->GetString(kSource));
            param.dstAddress = Gantry::Network::Ipv6Address(input->GetString(kDestination));
            ReadSpi(input->GetString(kSpi), param.spi);
            ipsecConfig.RemoveAutoSADConfig(param);
        } else {
            output->SetError(kWhichRemoval);
            return;
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
