#pragma once

// Reading and changing kernel interfaces inside one host operation's
// transaction: their IP settings as configured and in force, the checks the
// host makes of an IP configuration, and the port an attached interface holds
// on its switch. Every refusal is a GantryException whose text names the
// interface.

#include <optional>
#include <string>

#include "gantry/network/IpConfig.h"
#include "trellis/host/Transaction.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/TslNicRecord.h"

namespace Trellis {
namespace Network {
namespace TslNicStore {

Trellis::Host::TslNicRecord RequireTslNic(Trellis::Host::Transaction const& t, std::string const& name);
void RequireNetstack(Trellis::Host::Transaction const& t, std::string const& key, std::string const& refusal);

// The IP settings as configured (under DHCP the address is 0.0.0.0), and
// in force: under DHCP the lease 203.0.113.(10 + N mod 240)/24 of tslN;
// with router advertisements an AUTOCONF address 2001:db8:0:1:<EUI-64>/64,
// with DHCPv6 a DHCP address 2001:db8:0:2::<N+1>/64, after the static ones.
Gantry::Network::IpConfig ConfiguredIpConfig(Trellis::Host::TslNicRecord const& nic);
Gantry::Network::IpConfig IpConfigInForce(Trellis::Host::TslNicRecord const& nic);

// Takes config into nic after the host's checks, and its IPv4 address into
// the interface's port. Of the IPv6 addresses it keeps the static ones.
void StoreIpConfig(Trellis::Host::Transaction& t, Trellis::Host::TslNicRecord& nic,
                   Gantry::Network::IpConfig const& config);

// Deletes the interface, frees its port, and takes out of its netstack's
// routing what went through it alone.
void RemoveTslNic(Trellis::Host::Transaction& t, Trellis::Host::TslNicRecord const& nic);

// The port an attached interface holds on its switch, if any.
std::optional<Trellis::Host::PortRecord> PortOf(Trellis::Host::Transaction const& t,
                                                Trellis::Host::TslNicRecord const& nic);
// The switch the interface's connection point is on; "" for none.
std::string PortsetOf(Trellis::Host::Transaction const& t, Trellis::Host::TslNicRecord const& nic);

}  // namespace TslNicStore
}  // namespace Network
}  // namespace Trellis
