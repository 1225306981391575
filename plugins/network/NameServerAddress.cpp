#include "NameServerAddress.h"

#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv6Address.h"

namespace KorvexCli {
namespace NetworkNamespace {

std::unique_ptr<Gantry::Network::IpAddress> ParseNameServer(std::string const& text) {
    if (Gantry::Network::Ipv4Address::IsValidAddress(text))
        return std::make_unique<Gantry::Network::Ipv4Address>(text);
    if (Gantry::Network::Ipv6Address::IsValidAddress(text))
        return std::make_unique<Gantry::Network::Ipv6Address>(text);
    return nullptr;
}

std::string UnrecognisedAddressText(std::string const& text) {
    return "The specified address '" + text + "' is not recognised as a valid IP address";
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
