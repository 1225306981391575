#include "PortWalk.h"

#include <memory>

#include "CommandSupport.h"
#include "gantry/network/Portset.h"
#include "trellis/network/DVPortImpl.h"
#include "trellis/network/PortsetImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

void WalkSwitchPorts(Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo,
                     std::function<bool(WalkedSwitch&, Trellis::Network::PortImpl&)> const& visit) {
    const int numPorts = Gantry::Network::Portset::DEF_NUM_PORTS;
    OwnedVector<Gantry::Network::Portset> switches(vswitchInfo.GetAllSwitches());
    for (Gantry::Network::Portset* portset : switches) {
        std::string name = portset->GetName();
        std::unique_ptr<Trellis::Network::PortsetImpl> handle;
        Trellis::Network::DVSwitchImpl* distributed = nullptr;
        if (vswitchInfo.IsLegacySwitch(name)) {
            handle.reset(new Trellis::Network::VirtualSwitchImpl(name, numPorts));
        } else {
            distributed = new Trellis::Network::DVSwitchImpl(name, numPorts);
            handle.reset(distributed);
        }
        WalkedSwitch walked{name, distributed};
        OwnedVector<Trellis::Network::PortImpl> ports(handle->GetPorts());
        for (Trellis::Network::PortImpl* port : ports)
            if (!visit(walked, *port)) return;
    }
}

bool WithPort(Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo, long portId,
              std::function<void(Trellis::Network::PortImpl&)> const& work) {
    bool found = false;
    WalkSwitchPorts(vswitchInfo, [&](WalkedSwitch&, Trellis::Network::PortImpl& port) {
        if (port.GetPortId() != portId) return true;
        found = true;
        work(port);
        return false;
    });
    return found;
}

std::string NetworkOfPort(WalkedSwitch& walked, Trellis::Network::PortImpl& port) {
    if (walked.distributed == nullptr) return port.GetPortGroupName();
    Trellis::Network::DVPortImpl dvPort(walked.distributed->GetId(), port.GetDVPortId());
    return dvPort.GetDVPortgroupId();
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
