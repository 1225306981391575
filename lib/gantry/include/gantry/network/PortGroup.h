#pragma once

#include <cstdint>
#include <string>

#include "gantry/lib/GantryObject.h"
#include "gantry/network/NicTeamingPolicy.h"
#include "gantry/network/PortSecurityPolicy.h"
#include "gantry/network/ShapingPolicy.h"

namespace Gantry {
namespace Network {

class VirtualSwitch;

// A named set of ports on one standard switch; its name is unique on the
// host. It inherits each policy setting from its switch until it sets the
// setting itself. Every operation reports failure by throwing
// GantryException.
class PortGroup : public virtual Gantry::Lib::GantryObject {
public:
    static constexpr std::uint16_t MIN_VLAN_ID = 0;
    static constexpr std::uint16_t MAX_VLAN_ID = 4095;

    ~PortGroup() override;

    virtual std::string GetName() = 0;
    virtual std::string GetVirtualSwitchName() = 0;
    virtual int GetVlanId() = 0;
    virtual void SetVlanId(int vlanId) = 0;

    // Get...Policy: the values in force, inherited ones included.
    // GetLocal...Policy: what the group sets itself, told by setMask.
    // Apply...Policy: stores the group's local policy.
    virtual PortSecurityPolicy GetSecurityPolicy() = 0;
    virtual PortSecurityPolicy GetLocalSecurityPolicy() = 0;
    virtual void ApplySecurityPolicy(PortSecurityPolicy const& policy) = 0;
    virtual NicTeamingPolicy GetTeamingPolicy() = 0;
    virtual NicTeamingPolicy GetLocalTeamingPolicy() = 0;
    virtual void ApplyTeamingPolicy(NicTeamingPolicy const& policy) = 0;
    virtual ShapingPolicy GetShapingPolicy() = 0;
    virtual ShapingPolicy GetLocalShapingPolicy() = 0;
    virtual void ApplyShapingPolicy(ShapingPolicy const& policy) = 0;

    // The parent switch; the object belongs to the caller.
    virtual VirtualSwitch* GetVirtualSwitch() = 0;
};

}  // namespace Network
}  // namespace Gantry
