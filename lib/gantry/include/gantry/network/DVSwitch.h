#pragma once

#include <map>
#include <string>
#include <vector>

#include "gantry/network/DVPort.h"
#include "gantry/network/DVPortParam.h"
#include "gantry/network/LacpTypes.h"
#include "gantry/network/Portset.h"

namespace Gantry {
namespace Network {

// A distributed switch that the host takes part in. Objects and vectors of
// objects it hands out belong to the caller, except the running LACP groups,
// which go back through FreeLacpGroups. Every operation reports failure by
// throwing GantryException.
class DVSwitch : public virtual Portset {
public:
    ~DVSwitch() override;

    // The switch's identity, which addresses its ports.
    virtual std::string GetId() = 0;
    virtual int GetMtu() = 0;
    virtual int GetBeaconTimeout() = 0;  // seconds
    // "down", "listen", "advertise" or "both".
    virtual std::string GetCdpStatus() = 0;
    // Every port of the switch, in port order.
    virtual std::vector<DVPort*> GetDVPorts() = 0;

    // The uplink ports that have a NIC connected, keyed by uplink name; a
    // port of a named LAG is keyed "<lag name>-<index>".
    virtual std::map<std::string, DVPortParam> GetUplinkPortParams() = 0;
    // nicNames: the NICs connected to uplink ports; portNames: the names of
    // all uplink ports, NIC or not, as GetUplinkPort takes them.
    virtual void GetUplinkPortNames(std::vector<std::string>& nicNames, std::vector<std::string>& portNames) = 0;
    // The uplink port of that name, or null.
    virtual DVPort* GetUplinkPort(std::string const& name) = 0;
    // The named LAGs, in the order they were configured.
    virtual std::vector<LagConfig> GetLagConfigs() = 0;

    // The running LACP groups; the switch owns them until FreeLacpGroups.
    virtual std::vector<LacpGroup*>* GetLacpGroups() = 0;
    virtual void FreeLacpGroups(std::vector<LacpGroup*>* groups) = 0;
    // Short (true) or long timeout on one NIC of the LAG, or on all its NICs
    // when nicName is empty.
    virtual void SetLacpTimeout(int lagId, bool timeout, std::string const& nicName) = 0;
};

}  // namespace Network
}  // namespace Gantry
