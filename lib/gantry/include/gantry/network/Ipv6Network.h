#pragma once

#include <string>

#include "gantry/network/Ipv6Address.h"

namespace Gantry {
namespace Network {

// An IPv6 address with its prefix length, in "address/prefix" form, as an
// interface carries it: the address keeps its host bits ("2001:db8::5/64").
// It also carries the address's origin (type) and state (status) as the
// stack reports them. The empty value is "::/0", which is also the default
// network.
class Ipv6Network {
public:
    // Codes of GetIpv6AddressType: where the address came from.
    static constexpr int TYPE_STATIC = 0;
    static constexpr int TYPE_AUTOCONF = 7;
    static constexpr int TYPE_DHCP = 9;
    // Codes of GetIpv6AddressStatus: the duplicate detection and lifetime state.
    static constexpr int STATUS_TENTATIVE = 2;
    static constexpr int STATUS_DUPLICATED = 3;
    static constexpr int STATUS_PREFERRED = 4;
    static constexpr int STATUS_DEPRECATED = 5;

    // A new network is TYPE_STATIC and STATUS_PREFERRED: an address that an
    // administrator configures. The host sets other codes for the addresses
    // it obtains itself (router advertisements, DHCPv6).
    Ipv6Network();
    // "address/p" with p from 0 to 128; throws GantryException
    // ("Invalid IPv6 network: <text>") on anything else.
    explicit Ipv6Network(std::string const& text);
    // Throws GantryException for a prefix length above 128.
    Ipv6Network(Ipv6Address const& address, unsigned int prefixLength);

    Ipv6Network(Ipv6Network const&) = default;
    Ipv6Network& operator=(Ipv6Network const&) = default;

    // Whether the text is "address/prefix" with a valid IPv6 address (any form
    // Ipv6Address accepts) and a prefix length from 0 to 128.
    static bool IsValidAddressAndNetmask(std::string const& text);
    // The mask address of a prefix length: 64 gives "ffff:ffff:ffff:ffff::".
    // Throws GantryException above 128.
    static Ipv6Address NetmaskFromNumber(unsigned int prefixLength);

    Ipv6Address GetAddress() const { return address_; }
    // The prefix length.
    unsigned int GetNetmask() const { return prefixLength_; }
    // "2001:db8::5/64".
    std::string GetStringAddress() const;

    int GetIpv6AddressType() const { return type_; }
    void SetIpv6AddressType(int type) { type_ = type; }
    int GetIpv6AddressStatus() const { return status_; }
    void SetIpv6AddressStatus(int status) { status_ = status; }

    // Equal when address and prefix length are: type and status describe the
    // address's present state, not which address it is.
    friend bool operator==(Ipv6Network const& a, Ipv6Network const& b) {
        return a.address_ == b.address_ && a.prefixLength_ == b.prefixLength_;
    }
    friend bool operator!=(Ipv6Network const& a, Ipv6Network const& b) { return !(a == b); }

private:
    Ipv6Address address_;
    unsigned int prefixLength_;
    int type_;
    int status_;
};

}  // namespace Network
}  // namespace Gantry
