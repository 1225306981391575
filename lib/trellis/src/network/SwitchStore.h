#pragma once

// Reading and checking the switching records inside one host operation's
// transaction. Every refusal is a GantryException whose text names the
// object.

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "trellis/host/Transaction.h"
#include "trellis/host/records/PortRecord.h"
#include "trellis/host/records/SwitchRecords.h"

namespace Trellis {
namespace Network {
namespace SwitchStore {

[[noreturn]] void Refuse(std::string const& message);
// Refuses a name the host cannot keep (not valid UTF-8, or with a control
// character), the refusal text first: "Unable to ...: its name is not valid UTF-8".
void RequireStorableName(std::string const& name, std::string const& refusal);

Trellis::Host::StandardSwitchRecord RequireSwitch(Trellis::Host::Transaction const& t, std::string const& name);
Trellis::Host::PortGroupRecord RequirePortGroup(Trellis::Host::Transaction const& t, std::string const& name);

// The port groups of a switch, in the host's order.
std::vector<Trellis::Host::PortGroupRecord> PortGroupsOf(Trellis::Host::Transaction const& t,
                                                         std::string const& vswitch);
// The client ports on a switch (not its uplinks' ports), or in one port group.
std::int64_t ClientPortsOf(Trellis::Host::Transaction const& t, std::string const& vswitch);
std::int64_t ActiveClientsOf(Trellis::Host::Transaction const& t, Trellis::Host::PortGroupRecord const& group);
// Client ports and uplinks.
int UsedPortsOf(Trellis::Host::Transaction const& t, Trellis::Host::StandardSwitchRecord const& vswitch);
// The configured ports of all switches of the host.
int ConfiguredPortsOnHost(Trellis::Host::Transaction const& t);
// The switch, standard or distributed, that has the NIC as an uplink, if
// any, named with its kind: "virtual switch switch0".
std::optional<std::string> SwitchOfUplink(Trellis::Host::Transaction const& t, std::string const& nic);

// The ports the host hands out are numbered from here up, past the highest
// in use.
inline constexpr std::int64_t kFirstPortId = 33554432;
std::int64_t NewPortId(Trellis::Host::Transaction const& t);
// Gives a switch's new uplink a port of its own; takes the ports of one
// uplink (or of all, without nic) away.
void AddUplinkPort(Trellis::Host::Transaction& t, std::string const& vswitch, std::string const& nic);
void RemoveUplinkPorts(Trellis::Host::Transaction& t, std::string const& vswitch,
                       std::optional<std::string> const& nic);
// The port of the NIC's uplink on the switch (standard or distributed), if
// it has one.
std::optional<Trellis::Host::PortRecord> UplinkPortOf(Trellis::Host::Transaction const& t, std::string const& vswitch,
                                                      std::string const& nic);

// The policies in force on a port group, read with its switch's.
Trellis::Host::StoredPolicies PortGroupPolicies(Trellis::Host::Transaction const& t,
                                                Trellis::Host::PortGroupRecord const& group);

// The teaming policy as the host stores it for owner ("virtual switch
// switch0"): refuses a load balancing policy outside 1..4 and an uplink
// order with a name the host cannot keep, and drops the unnamed flag, which
// the host does not keep.
Gantry::Network::NicTeamingPolicy StorableTeamingPolicy(Gantry::Network::NicTeamingPolicy policy,
                                                        std::string const& owner);

// The shaping policy as the host stores it for owner: refuses a set
// bandwidth or burst size at or above 2^63, which a get could not show.
Gantry::Network::ShapingPolicy StorableShapingPolicy(Gantry::Network::ShapingPolicy const& policy,
                                                     std::string const& owner);

}  // namespace SwitchStore
}  // namespace Network
}  // namespace Trellis
