#pragma once

#include <array>
#include <cstdint>
#include <string>

namespace Gantry {
namespace Network {

// An IP address of either family, copied by value. Ipv4Address and
// Ipv6Address derive from it and add no data, so a copy through the base keeps
// the whole value; the base is what takes "an address of either family"
// (a name server, for instance).
//
// The empty value of each family is its all-zero address: "0.0.0.0" and "::".
// A default-constructed IpAddress is the empty IPv4 address.
class IpAddress {
public:
    enum class Family { Ipv4, Ipv6 };

    IpAddress();
    // Either family, in the forms that Ipv4Address and Ipv6Address accept.
    // Throws Gantry::Lib::GantryException on any other text.
    explicit IpAddress(std::string const& text);
    virtual ~IpAddress();
    IpAddress(IpAddress const&) = default;
    IpAddress& operator=(IpAddress const&) = default;

    bool IsIpv4() const { return family_ == Family::Ipv4; }
    bool IsIpv6() const { return family_ == Family::Ipv6; }
    // True for the empty value of the family ("0.0.0.0", "::").
    bool IsUnset() const;

    // Canonical text: dotted quad, or RFC 5952 form for IPv6 (lower case,
    // the longest run of zero groups compressed, "::ffff:192.0.2.1" for an
    // IPv4-mapped address).
    std::string GetStringAddress() const;

    // Addresses of different families are never equal.
    friend bool operator==(IpAddress const& a, IpAddress const& b);
    friend bool operator!=(IpAddress const& a, IpAddress const& b) { return !(a == b); }

protected:
    using Bytes = std::array<std::uint8_t, 16>;

    // IPv4 uses the first four bytes, in network order; the rest stay zero.
    IpAddress(Family family, Bytes const& bytes);

    // Parse the text of one family into bytes; false if it is not one.
    static bool Parse(Family family, std::string const& text, Bytes& bytes);

    Family family_;
    Bytes bytes_;
};

}  // namespace Network
}  // namespace Gantry
