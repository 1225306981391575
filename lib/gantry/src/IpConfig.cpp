#include "gantry/network/IpConfig.h"

#include <algorithm>

#include "gantry/lib/GantryException.h"

namespace Gantry {
namespace Network {

IpConfig::IpConfig()
    : ipv4UseNone_(true),
      useDhcp_(false),
      dhcpDns_(false),
      useIpv6Dhcp_(false),
      useIpv6RouterAdvertised_(false) {}

Ipv4Address IpConfig::GetIpv4Broadcast() const {
    if (ipv4Address_.IsUnset() || ipv4Netmask_.IsUnset())
        return Ipv4Address();
    return Ipv4Address(ipv4Address_.GetValue() | ~ipv4Netmask_.GetValue());
}

void IpConfig::SetIpv4Address(Ipv4Address const& address) {
    ipv4Address_ = address;
    useDhcp_ = false;
    ipv4UseNone_ = false;
}

void IpConfig::SetIpv4Netmask(Ipv4Address const& netmask) {
    ipv4Netmask_ = netmask;
    useDhcp_ = false;
    ipv4UseNone_ = false;
}

void IpConfig::SetIpv4UseNone() {
    ipv4UseNone_ = true;
    useDhcp_ = false;
    ipv4Address_ = Ipv4Address();
    ipv4Netmask_ = Ipv4Address();
}

void IpConfig::SetUseDhcp(bool useDhcp) {
    useDhcp_ = useDhcp;
    if (useDhcp)
        ipv4UseNone_ = false;
}

void IpConfig::AddIpv6Network(Ipv6Network const& network) {
    Ipv6Address address = network.GetAddress();
    bool present = std::any_of(ipv6Networks_.begin(), ipv6Networks_.end(),
                               [&](Ipv6Network const& n) { return n.GetAddress() == address; });
    if (present)
        throw Lib::GantryException("The IPv6 address " + address.GetStringAddress() +
                                   " is already configured on the interface");
    ipv6Networks_.push_back(network);
}

void IpConfig::RemoveIpv6Network(Ipv6Network const& network) {
    auto found = std::find(ipv6Networks_.begin(), ipv6Networks_.end(), network);
    if (found == ipv6Networks_.end())
        throw Lib::GantryException("The IPv6 address " + network.GetStringAddress() +
                                   " is not configured on the interface");
    ipv6Networks_.erase(found);
}

bool operator==(IpConfig const& a, IpConfig const& b) {
    auto sameNetwork = [](Ipv6Network const& x, Ipv6Network const& y) {
        return x == y && x.GetIpv6AddressType() == y.GetIpv6AddressType() &&
               x.GetIpv6AddressStatus() == y.GetIpv6AddressStatus();
    };
    return a.ipv4Address_ == b.ipv4Address_ && a.ipv4Netmask_ == b.ipv4Netmask_ &&
           a.ipv4UseNone_ == b.ipv4UseNone_ && a.useDhcp_ == b.useDhcp_ &&
           a.dhcpDns_ == b.dhcpDns_ && a.useIpv6Dhcp_ == b.useIpv6Dhcp_ &&
           a.useIpv6RouterAdvertised_ == b.useIpv6RouterAdvertised_ &&
           std::equal(a.ipv6Networks_.begin(), a.ipv6Networks_.end(), b.ipv6Networks_.begin(),
                      b.ipv6Networks_.end(), sameNetwork);
}

}  // namespace Network
}  // namespace Gantry
