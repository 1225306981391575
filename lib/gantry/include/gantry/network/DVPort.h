#pragma once

#include <string>
#include <vector>

#include "gantry/lib/GantryObject.h"
#include "gantry/network/LacpTypes.h"

namespace Gantry {
namespace Network {

// One port of a distributed switch. Every operation reports failure by
// throwing GantryException.
class DVPort : public virtual Gantry::Lib::GantryObject {
public:
    ~DVPort() override;

    virtual std::string GetPortId() = 0;
    // Fills in the names of the port's clients; whether it has any.
    virtual bool IsInUse(std::vector<std::string>& clients) = 0;
    // The identity of the distributed port group the port belongs to.
    virtual std::string GetPortGroupId() = 0;
    // The NIC connected to an uplink port; empty for any other port.
    virtual std::string GetUplinkName() = 0;
    // The port's own LACP setting (uplink ports of an uplink port group).
    virtual LacpPortConfig GetLacpConfig() = 0;
};

}  // namespace Network
}  // namespace Gantry
