#pragma once

#include <vector>

#include "gantry/network/Ipv4Address.h"
#include "gantry/network/Ipv6Network.h"

namespace Gantry {
namespace Network {

// The IP settings of one interface, handed out and taken back whole.
//
// IPv4 is in one of three modes: static (address and netmask), DHCP, or none.
// The setters keep the mode consistent:
// - SetIpv4Address and SetIpv4Netmask choose static mode (DHCP and none off);
// - SetUseDhcp(true) chooses DHCP and keeps the address and netmask, which
//   then hold the lease; SetUseDhcp(false) only clears the DHCP flag;
// - SetIpv4UseNone chooses none and clears address and netmask.
// So a configuration is rebuilt by setting the address and netmask first and
// the DHCP flag after them. The DHCP DNS flag and the IPv6 settings are
// independent of the mode.
//
// An empty IpConfig has no IPv4 settings (mode none, address and netmask
// "0.0.0.0"), no IPv6 address, and every other flag off.
class IpConfig {
public:
    IpConfig();

    Ipv4Address GetIpv4Address() const { return ipv4Address_; }
    Ipv4Address GetIpv4Netmask() const { return ipv4Netmask_; }
    // The address with all host bits set; "0.0.0.0" while either the
    // address or the netmask is empty.
    Ipv4Address GetIpv4Broadcast() const;
    void SetIpv4Address(Ipv4Address const& address);
    void SetIpv4Netmask(Ipv4Address const& netmask);

    bool GetIpv4UseNone() const { return ipv4UseNone_; }
    void SetIpv4UseNone();
    bool GetUseDhcp() const { return useDhcp_; }
    void SetUseDhcp(bool useDhcp);
    // Whether the name servers offered by DHCP (v4 or v6) are used.
    bool GetDhcpDns() const { return dhcpDns_; }
    void SetDhcpDns(bool dhcpDns) { dhcpDns_ = dhcpDns; }

    // The IPv6 addresses, in the order they were added. A copy, so that
    // `for (auto& n : nic->GetIpConfig().GetIpv6Network())` is safe.
    std::vector<Ipv6Network> GetIpv6Network() const { return ipv6Networks_; }
    // Throws GantryException if the address is there already, with any
    // prefix length (an interface holds an address once).
    void AddIpv6Network(Ipv6Network const& network);
    // Removes the entry with this address and prefix length; throws
    // GantryException if there is none.
    void RemoveIpv6Network(Ipv6Network const& network);

    bool GetUseIpv6Dhcp() const { return useIpv6Dhcp_; }
    void SetUseIpv6Dhcp(bool useIpv6Dhcp) { useIpv6Dhcp_ = useIpv6Dhcp; }
    bool GetUseIpv6RouterAdvertised() const { return useIpv6RouterAdvertised_; }
    void SetUseIpv6RouterAdvertised(bool use) { useIpv6RouterAdvertised_ = use; }

    // Compares every setting; IPv6 addresses by their order, address,
    // prefix, type and status.
    friend bool operator==(IpConfig const& a, IpConfig const& b);
    friend bool operator!=(IpConfig const& a, IpConfig const& b) { return !(a == b); }

private:
    Ipv4Address ipv4Address_;
    Ipv4Address ipv4Netmask_;
    bool ipv4UseNone_;
    bool useDhcp_;
    bool dhcpDns_;
    std::vector<Ipv6Network> ipv6Networks_;
    bool useIpv6Dhcp_;
    bool useIpv6RouterAdvertised_;
};

}  // namespace Network
}  // namespace Gantry
