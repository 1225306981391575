#pragma once

#include <string>

namespace Gantry {
namespace Network {

class DVPort;
class NetworkInfo;
class DVSwitch;
class PortGroup;
struct DVPortParam;
class VirtualSwitch;

// Lookups of host objects across the host. What they return belongs to the
// caller. The implementation library provides the operations.
class NetworkFactory {
public:
    // The host's network inventory.
    static NetworkInfo* GetNetworkInfo();
    // The port group of that name on any standard switch, or null.
    static PortGroup* GetPortGroupByName(std::string const& name);
    // The standard switch of that name; throws GantryException when there is
    // none.
    static VirtualSwitch* GetVirtualSwitchById(std::string const& name);
    // The distributed switch of that name, or null when no distributed switch
    // has it.
    static DVSwitch* GetDVSwitchByName(std::string const& name);
    // The port at these coordinates; throws GantryException when the switch
    // has no such port.
    static DVPort* GetDVPort(DVPortParam const& param);
};

}  // namespace Network
}  // namespace Gantry
