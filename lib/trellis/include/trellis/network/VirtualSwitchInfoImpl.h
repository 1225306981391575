#pragma once

#include <string>
#include <vector>

#include "gantry/network/DVSwitch.h"
#include "gantry/network/NicCapabilities.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/ShapingPolicy.h"
#include "gantry/network/VirtualSwitch.h"

namespace Trellis {
namespace Network {

// The directory of the host's switches, standard and distributed. A stack object; what it
// returns belongs to the caller. Its constructor is a host operation
// ("VirtualSwitchInfoImpl::VirtualSwitchInfoImpl"), so an armed fault makes it throw.
class VirtualSwitchInfoImpl {
public:
    VirtualSwitchInfoImpl();
    ~VirtualSwitchInfoImpl();

    // Creates a switch with these policies, MTU 1500, CDP "listen", no
    // uplinks and no port groups. Refuses an empty or taken name, a port
    // count outside 1..4096, and one that takes the configured ports of all
    // switches over 4608.
    Gantry::Network::VirtualSwitch* AddVirtualSwitchWithPolicy(Gantry::Network::NicTeamingPolicy const& teaming,
                                                               Gantry::Network::PortSecurityPolicy const& security,
                                                               Gantry::Network::ShapingPolicy const& shaping,
                                                               Gantry::Network::NicCapabilities const& capabilities,
                                                               std::string const& name, int numPorts);
    // Every standard switch, in the order they were created.
    std::vector<Gantry::Network::VirtualSwitch*> GetVirtualSwitches();
    // The named switch, or null.
    Gantry::Network::VirtualSwitch* GetVirtualSwitchByName(std::string const& name);
    // Deletes the switch with its port groups and frees its uplinks. Refuses
    // an unknown switch and one whose port groups have active clients.
    void RemoveVirtualSwitch(std::string const& name);

    // Every distributed switch, in the order they were created.
    std::vector<Gantry::Network::DVSwitch*> GetDVSwitches();
    // The distributed switch of that name, or null.
    Gantry::Network::DVSwitch* GetDVSwitchByName(std::string const& name);
    // Every switch: the standard ones, then the distributed ones.
    std::vector<Gantry::Network::Portset*> GetAllSwitches();
    // Whether the named switch is a standard one (false for a distributed
    // switch and for a name that no switch has).
    bool IsLegacySwitch(std::string const& name);
};

}  // namespace Network
}  // namespace Trellis
