#pragma once

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/PortGroup.h"
#include "gantry/network/VirtualSwitch.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The switch a policy command of a standard switch works on, or null after
// reporting "Unable to find a legacy virtual switch with the name <name>"
// for a name that is no valid switch name or names no switch.
std::unique_ptr<Gantry::Network::VirtualSwitch> FindLegacyVirtualSwitch(
    Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo, std::string const& name, Output& output);

// The port group of that name, or null after reporting "Unable to find a
// port group with the name <name>".
std::unique_ptr<Gantry::Network::PortGroup> FindPortGroup(std::string const& name, Output& output);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
