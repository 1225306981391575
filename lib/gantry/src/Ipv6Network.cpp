#include "gantry/network/Ipv6Network.h"

#include "NetworkText.h"
#include "gantry/lib/GantryException.h"

namespace Gantry {
namespace Network {

namespace {

bool Parse(std::string const& text, Ipv6Address& address, unsigned int& prefixLength) {
    std::string addressText;
    if (!SplitNetworkText(text, 128, addressText, prefixLength) ||
        !Ipv6Address::IsValidAddress(addressText))
        return false;
    address = Ipv6Address(addressText);
    return true;
}

void RequirePrefixLength(unsigned int prefixLength) {
    if (prefixLength > 128)
        throw Lib::GantryException("Invalid IPv6 prefix length: " + std::to_string(prefixLength));
}

}  // namespace

Ipv6Network::Ipv6Network() : prefixLength_(0), type_(TYPE_STATIC), status_(STATUS_PREFERRED) {}

Ipv6Network::Ipv6Network(std::string const& text) : Ipv6Network() {
    if (!Parse(text, address_, prefixLength_))
        throw Lib::GantryException("Invalid IPv6 network: " + text);
}

Ipv6Network::Ipv6Network(Ipv6Address const& address, unsigned int prefixLength) : Ipv6Network() {
    RequirePrefixLength(prefixLength);
    address_ = address;
    prefixLength_ = prefixLength;
}

bool Ipv6Network::IsValidAddressAndNetmask(std::string const& text) {
    Ipv6Address address;
    unsigned int prefixLength = 0;
    return Parse(text, address, prefixLength);
}

Ipv6Address Ipv6Network::NetmaskFromNumber(unsigned int prefixLength) {
    RequirePrefixLength(prefixLength);
    std::array<std::uint8_t, 16> mask{};
    for (unsigned int i = 0; i < 16; ++i) {
        unsigned int bitsHere = prefixLength > 8 * i ? prefixLength - 8 * i : 0;
        mask[i] = bitsHere >= 8 ? 0xff : static_cast<std::uint8_t>(0xff00 >> bitsHere);
    }
    return Ipv6Address(mask);
}

std::string Ipv6Network::GetStringAddress() const {
    return address_.GetStringAddress() + "/" + std::to_string(prefixLength_);
}

}  // namespace Network
}  // namespace Gantry
