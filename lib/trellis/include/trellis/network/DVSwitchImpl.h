#pragma once

#include <map>
#include <memory>
#include <string>
#include <vector>

#include "gantry/network/DVSwitch.h"
#include "trellis/host/records/DVSwitchRecords.h"
#include "trellis/network/PortsetImpl.h"

namespace Trellis {
namespace Network {

// A distributed switch of the simulated host. Made by a lookup it answers
// from the snapshot of its record; made as a handle on a name, it does no
// host I/O until asked (see PortsetImpl). Its running LACP groups are built
// from the record when asked and freed by FreeLacpGroups.
class DVSwitchImpl : public virtual Gantry::Network::DVSwitch, public PortsetImpl {
public:
    // The host's word for a distributed switch (GetClass).
    static constexpr const char* CLASS_NAME = "dvswitch";

    DVSwitchImpl(std::string const& name, int numPorts);
    // uplinks: the NICs of its uplink ports, in port order.
    DVSwitchImpl(Trellis::Host::DVSwitchRecord snapshot, std::vector<std::string> uplinks);
    ~DVSwitchImpl() override;

    std::string GetId() override;
    int GetMtu() override;
    int GetBeaconTimeout() override;
    std::string GetCdpStatus() override;
    // Whether the switch is the host maker's own kind of distributed switch.
    bool IsKorvexBranded();
    std::vector<Gantry::Network::DVPort*> GetDVPorts() override;

    std::map<std::string, Gantry::Network::DVPortParam> GetUplinkPortParams() override;
    void GetUplinkPortNames(std::vector<std::string>& nicNames, std::vector<std::string>& portNames) override;
    Gantry::Network::DVPort* GetUplinkPort(std::string const& name) override;
    std::vector<Gantry::Network::LagConfig> GetLagConfigs() override;

    std::vector<Gantry::Network::LacpGroup*>* GetLacpGroups() override;
    void FreeLacpGroups(std::vector<Gantry::Network::LacpGroup*>* groups) override;
    void SetLacpTimeout(int lagId, bool timeout, std::string const& nicName) override;

protected:
    void Load(Trellis::Host::Transaction const& t) override;

private:
    void Refresh(Trellis::Host::DVSwitchRecord record, std::vector<std::string> uplinks);

    Trellis::Host::DVSwitchRecord snapshot_;
};

}  // namespace Network
}  // namespace Trellis
