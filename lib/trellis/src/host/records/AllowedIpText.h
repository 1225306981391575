#pragma once

// The entries of a ruleset's allowed list as text. Parsing is the Gantry
// address types' own; this adds which of the four lists an entry belongs to
// and its one canonical text, so that a stored entry compares equal to any
// other spelling of it ("2001:DB8::1" is "2001:db8::1").

#include <optional>
#include <string>
#include <vector>

#include "trellis/host/records/FirewallRecords.h"

namespace Trellis {
namespace Host {

enum class AllowedIpKind { Ipv4Address, Ipv4Network, Ipv6Address, Ipv6Network };

struct AllowedIp {
    AllowedIpKind kind;
    std::string text;  // canonical
};

// The entry that text names, or nothing when text is neither an IPv4 or IPv6
// address nor an "address/prefix" network. The canonical text of an address
// is what the address types print; a network's host bits are cleared
// ("192.0.2.7/24" is "192.0.2.0/24") and its prefix has no leading zeros.
std::optional<AllowedIp> ParseAllowedIp(const std::string& text);

// The list of ips that holds entries of that kind.
std::vector<std::string>& ListOfKind(FirewallAllowedIps& ips, AllowedIpKind kind);

}  // namespace Host
}  // namespace Trellis
