#include "IpInterfaceIpv6AddressAdd.h"

#include "CommandSupport.h"
#include "Ipv6AddressChange.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kInterfaceName =
    Parameter::String("interface-name", "i",
                      "The name of the Tessel network interface to add a static IPv6 address to. This name must be "
                      "an interface listed in the interface list command.")
        .Required();
const Parameter kIpv6 =
    Parameter::String("ipv6", "I",
                      "The IPv6 address to add to the given Tessel network interface. This must be in X:X:X::/X "
                      "format")
        .Required();

}  // namespace

IpInterfaceIpv6AddressAdd::IpInterfaceIpv6AddressAdd() {
    SetDescription("Add a static IPv6 address to a given Tessel network interface.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpInterfaceIpv6AddressAdd::GetInputSpecInternal() {
    return InputSpecOf(kInterfaceName, kIpv6);
}

boost::shared_ptr<OutputSpec> IpInterfaceIpv6AddressAdd::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void IpInterfaceIpv6AddressAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    ChangeIpv6Address(*input, *output, kInterfaceName, kIpv6, &Gantry::Network::IpConfig::AddIpv6Network);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
