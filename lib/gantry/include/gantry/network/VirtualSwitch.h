#pragma once

#include <string>
#include <vector>

#include "gantry/network/CdpStatus.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/Portset.h"
#include "gantry/network/ShapingPolicy.h"

namespace Gantry {
namespace Network {

class PortGroup;

// A standard virtual switch. Objects and vectors of objects it hands out
// belong to the caller. Every operation reports failure by throwing
// GantryException.
class VirtualSwitch : public virtual Portset {
public:
    ~VirtualSwitch() override;

    // The switch's port groups, in the order they were added.
    virtual std::vector<PortGroup*> GetPortGroups() = 0;
    virtual int GetBeaconInterval() = 0;  // seconds
    virtual bool GetBeaconEnabled() = 0;
    virtual int GetBeaconThreshold() = 0;
    // Who needs beacon probing on this switch.
    virtual std::vector<std::string> GetBeaconRequiredBy() = 0;
    virtual void SetCdpStatus(CdpStatus status) = 0;
    // "down", "listen", "advertise" or "both".
    virtual std::string GetCdpStatus() = 0;
    virtual int GetMtu() = 0;
    virtual void SetMtu(int mtu) = 0;
    // Connects a physical NIC to the switch, or disconnects it.
    virtual void AddUplink(std::string const& nicName) = 0;
    virtual void RemoveUplink(std::string const& nicName) = 0;
    // Creates a port group on the switch; the new object belongs to the caller.
    virtual PortGroup* AddPortGroup(std::string const& portGroupName) = 0;
    virtual void RemovePortGroup(std::string const& portGroupName) = 0;

    // The policies in force on the switch, and storing them.
    virtual PortSecurityPolicy GetSecurityPolicy() = 0;
    virtual void ApplySecurityPolicy(PortSecurityPolicy const& policy) = 0;
    virtual ShapingPolicy GetShapingPolicy() = 0;
    virtual void ApplyShapingPolicy(ShapingPolicy const& policy) = 0;
    virtual NicTeamingPolicy GetTeamingPolicy() = 0;
    // What is set at the switch itself, told by setMask.
    virtual NicTeamingPolicy GetLocalTeamingPolicy() = 0;
    virtual void ApplyTeamingPolicy(NicTeamingPolicy const& policy) = 0;
};

}  // namespace Network
}  // namespace Gantry
