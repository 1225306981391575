#pragma once

#include <functional>
#include <string>

#include "trellis/network/DVSwitchImpl.h"
#include "trellis/network/PortImpl.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// One switch of the host as the port walk sees it.
struct WalkedSwitch {
    std::string name;
    // The walk's handle on the switch when it is a distributed one, else null.
    Trellis::Network::DVSwitchImpl* distributed;
};

// Hands every port in use on every switch of the host to visit: the switches
// in the host's order (standard ones first), each through a handle made for
// the walk, and each switch's ports in order. The walk stops after the first
// port for which visit returns false. Host failures are thrown.
void WalkSwitchPorts(Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo,
                     std::function<bool(WalkedSwitch&, Trellis::Network::PortImpl&)> const& visit);

// Runs work on the first port of the walk whose id is portId; false when no
// switch has it.
bool WithPort(Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo, long portId,
              std::function<void(Trellis::Network::PortImpl&)> const& work);

// The port group of a port on a standard switch, or the distributed port
// group of its DVPort.
std::string NetworkOfPort(WalkedSwitch& walked, Trellis::Network::PortImpl& port);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
