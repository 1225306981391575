#include "host/records/AllowedIpText.h"

#include <array>
#include <cstdint>

#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv4Network.h"
#include "gantry/network/Ipv6Address.h"
#include "gantry/network/Ipv6Network.h"

namespace Trellis {
namespace Host {

namespace {

using Gantry::Network::Ipv4Address;
using Gantry::Network::Ipv4Network;
using Gantry::Network::Ipv6Address;
using Gantry::Network::Ipv6Network;

// Ipv6Network keeps an interface address's host bits; an allowed network
// names the whole network, so they are cleared here as Ipv4Network does.
Ipv6Network WithoutHostBits(const Ipv6Network& network) {
    std::array<std::uint8_t, 16> bytes = network.GetAddress().GetBytes();
    unsigned int prefixLength = network.GetNetmask();
    for (unsigned int i = 0; i < bytes.size(); ++i) {
        unsigned int bitsKept = prefixLength > i * 8 ? prefixLength - i * 8 : 0;
        if (bitsKept < 8) bytes[i] &= static_cast<std::uint8_t>(0xFF00u >> bitsKept);
    }
    return Ipv6Network(Ipv6Address(bytes), prefixLength);
}

}  // namespace

std::optional<AllowedIp> ParseAllowedIp(const std::string& text) {
    if (Ipv4Address::IsValidAddress(text))
        return AllowedIp{AllowedIpKind::Ipv4Address, Ipv4Address(text).GetStringAddress()};
    if (Ipv6Address::IsValidAddress(text))
        return AllowedIp{AllowedIpKind::Ipv6Address, Ipv6Address(text).GetStringAddress()};
    if (Ipv4Network::IsValidAddressAndNetmask(text))
        return AllowedIp{AllowedIpKind::Ipv4Network, Ipv4Network(text).GetStringAddress()};
    if (Ipv6Network::IsValidAddressAndNetmask(text))
        return AllowedIp{AllowedIpKind::Ipv6Network, WithoutHostBits(Ipv6Network(text)).GetStringAddress()};
    return std::nullopt;
}

std::vector<std::string>& ListOfKind(FirewallAllowedIps& ips, AllowedIpKind kind) {
    switch (kind) {
        case AllowedIpKind::Ipv4Address:
            return ips.ipv4Addresses;
        case AllowedIpKind::Ipv4Network:
            return ips.ipv4Networks;
        case AllowedIpKind::Ipv6Address:
            return ips.ipv6Addresses;
        case AllowedIpKind::Ipv6Network:
            break;
    }
    return ips.ipv6Networks;
}

}  // namespace Host
}  // namespace Trellis
