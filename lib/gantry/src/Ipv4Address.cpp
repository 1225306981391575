#include "gantry/network/Ipv4Address.h"

#include "gantry/lib/GantryException.h"

namespace Gantry {
namespace Network {

Ipv4Address::Ipv4Address() : IpAddress(Family::Ipv4, Bytes{}) {}

Ipv4Address::Ipv4Address(std::string const& text) : IpAddress(Family::Ipv4, Bytes{}) {
    if (!Parse(Family::Ipv4, text, bytes_))
        throw Lib::GantryException("Invalid IPv4 address: " + text);
}

Ipv4Address::Ipv4Address(std::uint32_t value)
    : IpAddress(Family::Ipv4, Bytes{static_cast<std::uint8_t>(value >> 24),
                                    static_cast<std::uint8_t>(value >> 16),
                                    static_cast<std::uint8_t>(value >> 8),
                                    static_cast<std::uint8_t>(value)}) {}

bool Ipv4Address::IsValidAddress(std::string const& text) {
    Bytes ignored;
    return Parse(Family::Ipv4, text, ignored);
}

std::uint32_t Ipv4Address::GetValue() const {
    return (std::uint32_t(bytes_[0]) << 24) | (std::uint32_t(bytes_[1]) << 16) |
           (std::uint32_t(bytes_[2]) << 8) | std::uint32_t(bytes_[3]);
}

}  // namespace Network
}  // namespace Gantry
