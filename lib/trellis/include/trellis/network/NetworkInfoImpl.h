#pragma once

#include <string>
#include <vector>

#include "gantry/network/NetworkInfo.h"
#include "gantry/network/Pnic.h"
#include "gantry/network/PortGroup.h"

namespace Trellis {
namespace Network {

// The host's network inventory. A stack object; what it returns belongs to
// the caller. Its constructor is a host operation ("NetworkInfoImpl::NetworkInfoImpl"),
// so an armed fault makes it throw.
class NetworkInfoImpl : public virtual Gantry::Network::NetworkInfo {
public:
    NetworkInfoImpl();
    ~NetworkInfoImpl() override;

    int GetNetstackInstanceState(std::string const& key) override;

    // Every physical NIC, in the host's order.
    std::vector<Gantry::Network::Pnic*> GetPnics();
    // The NIC of that name, or null.
    Gantry::Network::Pnic* GetPnicByName(std::string const& name);
    // Every port group of every standard switch.
    std::vector<Gantry::Network::PortGroup*> GetAllPortGroups();
};

}  // namespace Network
}  // namespace Trellis
