#pragma once

#include <functional>

#include "CommandSupport.h"
#include "gantry/network/VirtualSwitch.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The steps of the commands that make one change on a standard switch given
// by name (uplink add and remove, port group add and remove): read the
// switch's name and the other name, take the switch with
// NetworkFactory::GetVirtualSwitchById, call change on it with the other
// name, and deliver true. The host's failure text is reported as it stands.
void ChangeVirtualSwitch(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output, Parameter const& vswitchName,
                         Parameter const& otherName,
                         std::function<void(Gantry::Network::VirtualSwitch&, std::string const&)> const& change);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
