#include "gantry/network/Ipv6Address.h"

#include "gantry/lib/GantryException.h"

namespace Gantry {
namespace Network {

Ipv6Address::Ipv6Address() : IpAddress(Family::Ipv6, Bytes{}) {}

Ipv6Address::Ipv6Address(std::string const& text) : IpAddress(Family::Ipv6, Bytes{}) {
    if (!Parse(Family::Ipv6, text, bytes_))
        throw Lib::GantryException("Invalid IPv6 address: " + text);
}

Ipv6Address::Ipv6Address(std::array<std::uint8_t, 16> const& bytes)
    : IpAddress(Family::Ipv6, bytes) {}

bool Ipv6Address::IsValidAddress(std::string const& text) {
    Bytes ignored;
    return Parse(Family::Ipv6, text, ignored);
}

}  // namespace Network
}  // namespace Gantry
