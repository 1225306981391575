#include "IpInterfaceIpv6AddressRemove.h"

#include "CommandSupport.h"
#include "Ipv6AddressChange.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface to remove an IPv6 address from. This name must be "
                      "an interface listed in the interface list command.")
        .Required();
const Parameter kIpv6 =
    Parameter::String("ipv6", "I",
                      "The IPv6 address to remove from the given Tessel network interface. This must be in "
                      "X:X:X::/X format")
        .Required();

}  // namespace

IpInterfaceIpv6AddressRemove::IpInterfaceIpv6AddressRemove() {
    SetDescription("Remove an IPv6 address from a given Tessel network interface.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceIpv6AddressRemove::GetInputSpecInternal() {
    return InputSpecOf(kInterfaceName, kIpv6);
}

boost::shared_ptr<OutputSpec> IpInterfaceIpv6AddressRemove::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void IpInterfaceIpv6AddressRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    ChangeIpv6Address(*input, *output, kInterfaceName, kIpv6, &Gantry::Network::IpConfig::RemoveIpv6Network);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
