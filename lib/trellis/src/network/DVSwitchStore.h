#pragma once

// Reading the records of distributed switches inside one host operation's
// transaction. Every refusal is a GantryException whose text names the
// object.

#include <map>
#include <string>
#include <vector>

#include "trellis/host/Transaction.h"
#include "trellis/host/records/DVSwitchRecords.h"

namespace Trellis {
namespace Network {
namespace DVSwitchStore {

Trellis::Host::DVSwitchRecord RequireDVSwitch(Trellis::Host::Transaction const& t, std::string const& name);
// The switch's ports, in port order.
std::vector<Trellis::Host::DVPortRecord> PortsOf(Trellis::Host::Transaction const& t, std::string const& dvswitch);
// The NICs connected to the switch's uplink ports, in port order.
std::vector<std::string> UplinksOf(Trellis::Host::Transaction const& t, std::string const& dvswitch);
// The clients on each DVPort of the switch, by port id.
std::map<std::string, std::vector<std::string>> ClientsByPort(Trellis::Host::Transaction const& t,
                                                              std::string const& dvswitch);
// The distributed switch one of whose uplink ports has the NIC, or "".
std::string SwitchOfNic(Trellis::Host::Transaction const& t, std::string const& nic);

}  // namespace DVSwitchStore
}  // namespace Network
}  // namespace Trellis
