#pragma once

#include <string>
#include <vector>

#include "gantry/network/PnicStats.h"
#include "gantry/network/Portset.h"

namespace Trellis {
namespace Host {
class Operation;
class Transaction;
}  // namespace Host
namespace Network {
class PortImpl;
}  // namespace Network
}  // namespace Trellis

namespace Trellis {
namespace Network {

// What every switch of the simulated host shares: its name, its ports and its
// uplinks, from the snapshot taken by the lookup that made the object. The
// used ports are counted on the host when asked.
//
// A switch object made as a handle on a name (VirtualSwitchImpl(name,
// numPorts), DVSwitchImpl(name, numPorts)) does no host I/O when made: the
// first operation that needs the switch's record reads it inside its own
// transaction, and fails there with the host's text when no such switch
// exists.
class PortsetImpl : public virtual Gantry::Network::Portset {
public:
    ~PortsetImpl() override;

    std::string GetName() override;
    int GetNumPorts() override;
    int GetConfiguredPorts() override;
    int GetUsedPorts() override;
    std::vector<std::string> GetUplinks() override;
    std::string GetClass() override;
    // The ports in use on the switch (clients and uplinks), in the host's
    // order; owned by the caller.
    std::vector<PortImpl*> GetPorts();
    // The counters of each VLAN active on the uplink of that NIC, in the
    // order of their ids; released by DeleteVector. Empty while collection
    // is off. Refuses a NIC that is no uplink of the switch.
    std::vector<Gantry::Network::VlanStats*> GetUplinkVlanStats(std::string nicName);
    // Switches the collection of VLAN counters on the uplink on or off;
    // switching it off drops the counters.
    void SetUplinkVlanStatsEnabled(std::string nicName, bool enabled);

    // Whether a standard switch of that name exists.
    static bool IsValidVirtualSwitch(std::string const& name);

protected:
    PortsetImpl(std::string name, int numPorts, std::vector<std::string> uplinks, std::string className);
    // A handle: nothing is read until an operation needs the record.
    PortsetImpl(std::string name, int numPorts, std::string className);

    // Reads the switch's record into the snapshot (throws GantryException
    // when there is no such switch).
    virtual void Load(Trellis::Host::Transaction const& t) = 0;
    // The frame of a getter: operation.Check() on a loaded object; on a
    // handle, Load inside operation's own read.
    void Answer(Trellis::Host::Operation const& operation);
    // Load, if not loaded yet, inside an operation's transaction.
    void EnsureLoaded(Trellis::Host::Transaction const& t);
    void MarkLoaded() { loaded_ = true; }

    std::string name_;
    int numPorts_;
    std::vector<std::string> uplinks_;

private:
    std::string className_;
    bool loaded_;
};

}  // namespace Network
}  // namespace Trellis
