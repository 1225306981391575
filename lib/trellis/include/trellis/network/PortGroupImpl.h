#pragma once

#include <cstdint>
#include <string>

#include "gantry/network/ConnectionPoint.h"
#include "gantry/network/PortGroup.h"
#include "trellis/host/records/SwitchRecords.h"

namespace Trellis {
namespace Network {

// A port group of the simulated host. Its name, switch and VLAN id come from
// the snapshot of its record; its policies in force are read with its
// switch's at the call, since the switch's may have changed. It is also the
// connection point of the interfaces attached to it.
class PortGroupImpl : public virtual Gantry::Network::PortGroup, public virtual Gantry::Network::ConnectionPoint {
public:
    // The port group of that name; throws GantryException when there is none
    // (a host operation, "PortGroupImpl::PortGroupImpl").
    explicit PortGroupImpl(std::string const& name);
    explicit PortGroupImpl(Trellis::Host::PortGroupRecord snapshot);
    ~PortGroupImpl() override;

    std::string GetName() override;
    std::string GetVirtualSwitchName() override;
    int GetVlanId() override;
    // Refuses an id outside MIN_VLAN_ID..MAX_VLAN_ID.
    void SetVlanId(int vlanId) override;

    Gantry::Network::PortSecurityPolicy GetSecurityPolicy() override;
    Gantry::Network::PortSecurityPolicy GetLocalSecurityPolicy() override;
    void ApplySecurityPolicy(Gantry::Network::PortSecurityPolicy const& policy) override;
    Gantry::Network::NicTeamingPolicy GetTeamingPolicy() override;
    Gantry::Network::NicTeamingPolicy GetLocalTeamingPolicy() override;
    void ApplyTeamingPolicy(Gantry::Network::NicTeamingPolicy const& policy) override;
    Gantry::Network::ShapingPolicy GetShapingPolicy() override;
    Gantry::Network::ShapingPolicy GetLocalShapingPolicy() override;
    void ApplyShapingPolicy(Gantry::Network::ShapingPolicy const& policy) override;

    Gantry::Network::VirtualSwitch* GetVirtualSwitch() override;

    // As a connection point: TYPE_PORTGROUP on its switch; valid while the
    // group exists. The other kinds' payloads throw GantryException.
    int GetType() override;
    bool IsValid() override;
    std::string GetPortsetName() override;
    std::string GetPortGroupName() override;
    Gantry::Network::DVPortParam GetDVPortParam() override;
    Gantry::Network::OpaqueNetworkParam GetOpaqueNetworkParam() override;

    // The ports in use in this group, counted on the host.
    std::int64_t GetActiveClients();

private:
    Trellis::Host::PortGroupRecord snapshot_;
};

}  // namespace Network
}  // namespace Trellis
