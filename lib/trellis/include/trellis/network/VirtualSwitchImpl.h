#pragma once

#include <string>
#include <vector>

#include "gantry/network/VirtualSwitch.h"
#include "trellis/host/records/SwitchRecords.h"
#include "trellis/network/PortsetImpl.h"

namespace Trellis {
namespace Host {
class Operation;
}  // namespace Host

namespace Network {

// A standard switch of the simulated host. Its getters answer from the
// snapshot of its record; its changing operations re-read and write the
// stored record in one transaction and then refresh the snapshot.
class VirtualSwitchImpl : public virtual Gantry::Network::VirtualSwitch, public PortsetImpl {
public:
    // The host's word for a standard switch (GetClass).
    static constexpr const char* CLASS_NAME = "etherswitch";

    // A handle on a name (see PortsetImpl).
    VirtualSwitchImpl(std::string const& name, int numPorts);
    explicit VirtualSwitchImpl(Trellis::Host::StandardSwitchRecord snapshot);
    ~VirtualSwitchImpl() override;

    std::vector<Gantry::Network::PortGroup*> GetPortGroups() override;
    int GetBeaconInterval() override;
    bool GetBeaconEnabled() override;
    int GetBeaconThreshold() override;
    // The names of those whose failure detection in force is beacon probing:
    // the switch itself first, then its port groups in order.
    std::vector<std::string> GetBeaconRequiredBy() override;
    void SetCdpStatus(Gantry::Network::CdpStatus status) override;
    std::string GetCdpStatus() override;
    int GetMtu() override;
    void SetMtu(int mtu) override;
    void AddUplink(std::string const& nicName) override;
    void RemoveUplink(std::string const& nicName) override;
    Gantry::Network::PortGroup* AddPortGroup(std::string const& portGroupName) override;
    void RemovePortGroup(std::string const& portGroupName) override;

    Gantry::Network::PortSecurityPolicy GetSecurityPolicy() override;
    void ApplySecurityPolicy(Gantry::Network::PortSecurityPolicy const& policy) override;
    Gantry::Network::ShapingPolicy GetShapingPolicy() override;
    void ApplyShapingPolicy(Gantry::Network::ShapingPolicy const& policy) override;
    Gantry::Network::NicTeamingPolicy GetTeamingPolicy() override;
    Gantry::Network::NicTeamingPolicy GetLocalTeamingPolicy() override;
    void ApplyTeamingPolicy(Gantry::Network::NicTeamingPolicy const& policy) override;

protected:
    void Load(Trellis::Host::Transaction const& t) override;

private:
    // Re-reads the stored record, lets change edit it, writes it back and
    // takes it as the new snapshot: the frame of every changing operation.
    template <class Change>
    void Update(Trellis::Host::Operation const& operation, Change&& change);
    void Refresh(Trellis::Host::StandardSwitchRecord const& record);

    Trellis::Host::StandardSwitchRecord snapshot_;
};

}  // namespace Network
}  // namespace Trellis
