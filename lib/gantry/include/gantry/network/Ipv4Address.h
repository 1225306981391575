#pragma once

#include <cstdint>
#include <string>

#include "gantry/network/IpAddress.h"

namespace Gantry {
namespace Network {

// An IPv4 address. The empty value is "0.0.0.0".
class Ipv4Address : public IpAddress {
public:
    Ipv4Address();
    // Dotted quad as IsValidAddress accepts it; throws GantryException
    // ("Invalid IPv4 address: <text>") otherwise.
    explicit Ipv4Address(std::string const& text);
    // From the 32-bit value in host byte order (0xC0000201 is 192.0.2.1).
    explicit Ipv4Address(std::uint32_t value);

    // Exactly four decimal octets 0..255 separated by points, without leading
    // zeros, blanks, a prefix or short forms such as "10.1".
    static bool IsValidAddress(std::string const& text);

    // The 32-bit value in host byte order.
    std::uint32_t GetValue() const;
};

}  // namespace Network
}  // namespace Gantry
