#pragma once

#include <array>
#include <cstdint>
#include <string>

namespace Gantry {
namespace Network {

// A MAC address, text form "xx:xx:xx:xx:xx:xx". The empty value is
// "00:00:00:00:00:00"; where a MAC address is requested, it means that none
// is, and the system assigns one.
class MacAddress {
public:
    using Bytes = std::array<std::uint8_t, 6>;

    MacAddress();
    // Six pairs of hex digits of either case separated by colons; any such
    // address, multicast ones too (what a host reports is taken as it is).
    // Throws GantryException ("Invalid MAC address: <text>") otherwise.
    explicit MacAddress(std::string const& text);
    explicit MacAddress(Bytes const& bytes);

    // Whether the text is a well-formed address (as the constructor takes it)
    // that can be given to an interface: a unicast address (the low bit of
    // the first octet clear) and not the all-zero empty value.
    static bool IsValid(std::string const& text);

    // Lower case with colons: "00:50:56:a1:b2:c3".
    std::string GetStringAddress() const;
    bool IsUnset() const;
    bool IsMulticast() const { return (bytes_[0] & 0x01) != 0; }

    friend bool operator==(MacAddress const& a, MacAddress const& b) { return a.bytes_ == b.bytes_; }
    friend bool operator!=(MacAddress const& a, MacAddress const& b) { return !(a == b); }

private:
    static bool Parse(std::string const& text, Bytes& bytes);

    Bytes bytes_;
};

}  // namespace Network
}  // namespace Gantry
