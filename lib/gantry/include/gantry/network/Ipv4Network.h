#pragma once

#include <string>

#include "gantry/network/Ipv4Address.h"

namespace Gantry {
namespace Network {

// An IPv4 network: an address with its prefix length, in "address/prefix"
// form. The host bits are cleared on construction, so "192.0.2.7/24" is
// stored, compared and printed as "192.0.2.0/24". The empty value is
// "0.0.0.0/0", which is also the default network.
class Ipv4Network {
public:
    Ipv4Network();
    // "a.b.c.d/p" with p from 0 to 32; throws GantryException
    // ("Invalid IPv4 network: <text>") on anything else.
    explicit Ipv4Network(std::string const& text);
    // Throws GantryException for a prefix length above 32.
    Ipv4Network(Ipv4Address const& address, unsigned int prefixLength);
    // Throws GantryException for a netmask whose one bits are not contiguous.
    Ipv4Network(Ipv4Address const& address, Ipv4Address const& netmask);

    Ipv4Network(Ipv4Network const&) = default;
    Ipv4Network& operator=(Ipv4Network const&) = default;

    // Whether the text is a valid "address/prefix" form.
    static bool IsValidAddressAndNetmask(std::string const& text);
    // Whether the address is a netmask: ones followed by zeros only.
    static bool IsValidNetmask(Ipv4Address const& netmask);

    Ipv4Address GetNetwork() const { return network_; }
    Ipv4Address GetNetmask() const;
    // "192.0.2.0/24".
    std::string GetStringAddress() const;

    friend bool operator==(Ipv4Network const& a, Ipv4Network const& b) {
        return a.network_ == b.network_ && a.prefixLength_ == b.prefixLength_;
    }
    friend bool operator!=(Ipv4Network const& a, Ipv4Network const& b) { return !(a == b); }

private:
    void Assign(Ipv4Address const& address, unsigned int prefixLength);

    Ipv4Address network_;
    unsigned int prefixLength_;
};

}  // namespace Network
}  // namespace Gantry
