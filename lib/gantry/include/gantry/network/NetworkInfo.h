#pragma once

#include <string>
#include <vector>

#include "gantry/lib/GantryObject.h"
#include "gantry/network/Pnic.h"

namespace Gantry {
namespace Network {

// The host's network inventory, as NetworkFactory::GetNetworkInfo hands it
// out. Every operation reports failure by throwing GantryException.
class NetworkInfo : public virtual Gantry::Lib::GantryObject {
public:
    // GetNetstackInstanceState of an instance that exists in the kernel.
    static constexpr int NETSTACK_STATE_IN_KERNEL = 0x1234;

    ~NetworkInfo() override;

    // The state word of the instance; NETSTACK_STATE_IN_KERNEL when it exists
    // in the kernel, 0 when it is only configured or unknown.
    virtual int GetNetstackInstanceState(std::string const& key) = 0;
    // Every physical NIC present and loaded, in the host's order; the caller
    // deletes each element.
    virtual std::vector<Pnic*> GetPnics() = 0;
    // The NIC of that name, owned by the caller, or null.
    virtual Pnic* GetPnicByName(std::string const& name) = 0;
};

}  // namespace Network
}  // namespace Gantry
