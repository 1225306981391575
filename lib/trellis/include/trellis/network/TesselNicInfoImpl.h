#pragma once

#include <string>
#include <vector>

#include "gantry/network/ConnectionPoint.h"
#include "gantry/network/IpConfig.h"
#include "gantry/network/MacAddress.h"
#include "gantry/network/TslNic.h"
#include "gantry/network/TslNicTagType.h"

namespace Trellis {
namespace Network {

// The directory of the host's kernel network interfaces. A stack object; what
// it returns belongs to the caller. Its constructor is a host operation
// ("TesselNicInfoImpl::TesselNicInfoImpl"), so an armed fault makes it throw.
class TesselNicInfoImpl {
public:
    TesselNicInfoImpl();
    ~TesselNicInfoImpl();

    // Creates an interface on the point, in the netstack, and takes a port
    // for it on the point's switch, all in one transaction. An unset MAC
    // address asks the host for one, an MTU of 0 for 1500, an empty name for
    // the lowest free tslN. Refuses a taken name or MAC address, a name
    // outside tsl0-tsl255, an MTU outside MIN_MTU..MAX_MTU, a netstack that
    // does not exist, a point that cannot take it (a DVPort that is in use or
    // an uplink port) and a switch without a free port.
    Gantry::Network::TslNic* AddTesselNic(Gantry::Network::ConnectionPoint* point, std::string const& netstackKey,
                                          Gantry::Network::IpConfig ipConfig, Gantry::Network::MacAddress mac,
                                          unsigned int flags, unsigned int mtu, std::string name);
    // Deletes the interface attached at the point in that netstack, and frees
    // its port. Refuses when there is none.
    void RemoveTesselNic(Gantry::Network::ConnectionPoint* point, std::string const& netstackKey);

    // Every interface, by name (tsl0, tsl1, ..., tsl10).
    std::vector<Gantry::Network::TslNic*> GetTesselNics();
    std::vector<Gantry::Network::TslNic*> GetTesselNicsByInstanceKey(std::string const& netstackKey);
    std::vector<Gantry::Network::TslNic*> GetTesselNicsByTag(Gantry::Network::TslNicTagType tag);
    void GetTesselNicNamesByInstanceKey(std::vector<std::string>& names, std::string const& netstackKey);
    // The interface of that name, or null. The simulated host has no use for
    // the flag.
    Gantry::Network::TslNic* GetTesselNicByInterface(std::string const& name, bool refresh);
};

}  // namespace Network
}  // namespace Trellis
