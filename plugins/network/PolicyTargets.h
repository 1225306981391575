#pragma once

#include <functional>
#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/PortGroup.h"
#include "gantry/network/VirtualSwitch.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The steps that the policy commands of a standard switch share: read the
// switch's name, find the switch, run work on it and deliver what work
// returns with SetResult and Finish. A name that is no valid switch name or
// names no switch is reported as "Unable to find a legacy virtual switch with
// the name <name>", without a result; a GantryException as its text.
void RunOnLegacySwitch(Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo, Input& input, Output& output,
                       Parameter const& vswitchName,
                       std::function<boost::shared_ptr<Plinth::MetaObj::MetaObject>(Gantry::Network::VirtualSwitch&)> const& work);

// The same for the policy commands of a port group: "Unable to find a port
// group with the name <name>" for a group that does not exist.
void RunOnPortGroup(Input& input, Output& output, Parameter const& portGroupName,
                    std::function<boost::shared_ptr<Plinth::MetaObj::MetaObject>(Gantry::Network::PortGroup&)> const& work);

// The port group of that name, or null after reporting "Unable to find a
// port group with the name <name>".
std::unique_ptr<Gantry::Network::PortGroup> FindPortGroup(std::string const& name, Output& output);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
