#pragma once

#include <array>
#include <cstdint>
#include <string>

#include "gantry/network/IpAddress.h"

namespace Gantry {
namespace Network {

// An IPv6 address. The empty value is "::".
class Ipv6Address : public IpAddress {
public:
    Ipv6Address();
    // Any text form IsValidAddress accepts; throws GantryException
    // ("Invalid IPv6 address: <text>") otherwise.
    explicit Ipv6Address(std::string const& text);
    explicit Ipv6Address(std::array<std::uint8_t, 16> const& bytes);

    // Every standard text form: full, compressed ("::", "::1",
    // "2001:db8::1"), with an embedded IPv4 address ("::ffff:192.0.2.1"),
    // hex digits of either case. Nothing else: no zone id ("fe80::1%eth0"),
    // no brackets, no blanks, no prefix.
    static bool IsValidAddress(std::string const& text);

    std::array<std::uint8_t, 16> GetBytes() const { return bytes_; }
};

}  // namespace Network
}  // namespace Gantry
