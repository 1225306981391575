#include "gantry/network/Ipv4Network.h"

#include "NetworkText.h"
#include "gantry/lib/GantryException.h"

namespace Gantry {
namespace Network {

namespace {

std::uint32_t MaskOf(unsigned int prefixLength) {
    return prefixLength == 0 ? 0 : ~std::uint32_t(0) << (32 - prefixLength);
}

bool Parse(std::string const& text, Ipv4Address& address, unsigned int& prefixLength) {
    std::string addressText;
    if (!SplitNetworkText(text, 32, addressText, prefixLength) ||
        !Ipv4Address::IsValidAddress(addressText))
        return false;
    address = Ipv4Address(addressText);
    return true;
}

}  // namespace

Ipv4Network::Ipv4Network() : prefixLength_(0) {}

Ipv4Network::Ipv4Network(std::string const& text) : prefixLength_(0) {
    Ipv4Address address;
    unsigned int prefixLength = 0;
    if (!Parse(text, address, prefixLength))
        throw Lib::GantryException("Invalid IPv4 network: " + text);
    Assign(address, prefixLength);
}

Ipv4Network::Ipv4Network(Ipv4Address const& address, unsigned int prefixLength) : prefixLength_(0) {
    if (prefixLength > 32)
        throw Lib::GantryException("Invalid IPv4 prefix length: " + std::to_string(prefixLength));
    Assign(address, prefixLength);
}

Ipv4Network::Ipv4Network(Ipv4Address const& address, Ipv4Address const& netmask) : prefixLength_(0) {
    if (!IsValidNetmask(netmask))
        throw Lib::GantryException("Invalid IPv4 netmask: " + netmask.GetStringAddress());
    unsigned int prefixLength = 0;
    for (std::uint32_t mask = netmask.GetValue(); mask != 0; mask <<= 1)
        ++prefixLength;
    Assign(address, prefixLength);
}

void Ipv4Network::Assign(Ipv4Address const& address, unsigned int prefixLength) {
    network_ = Ipv4Address(address.GetValue() & MaskOf(prefixLength));
    prefixLength_ = prefixLength;
}

bool Ipv4Network::IsValidAddressAndNetmask(std::string const& text) {
    Ipv4Address address;
    unsigned int prefixLength = 0;
    return Parse(text, address, prefixLength);
}

bool Ipv4Network::IsValidNetmask(Ipv4Address const& netmask) {
    // Ones then zeros: the inverted mask plus one is a power of two (or zero).
    std::uint32_t hostBits = ~netmask.GetValue();
    return (hostBits & (hostBits + 1)) == 0;
}

Ipv4Address Ipv4Network::GetNetmask() const {
    return Ipv4Address(MaskOf(prefixLength_));
}

std::string Ipv4Network::GetStringAddress() const {
    return network_.GetStringAddress() + "/" + std::to_string(prefixLength_);
}

}  // namespace Network
}  // namespace Gantry
