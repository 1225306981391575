#include "PolicyTargets.h"

#include "gantry/network/NetworkFactory.h"
#include "trellis/network/PortsetImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

std::unique_ptr<Gantry::Network::VirtualSwitch> FindLegacyVirtualSwitch(
    Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo, std::string const& name, Output& output) {
    std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch;
    if (Trellis::Network::PortsetImpl::IsValidVirtualSwitch(name)) {
        vswitch.reset(vswitchInfo.GetVirtualSwitchByName(name));
    }
    if (!vswitch) output.SetError("Unable to find a legacy virtual switch with the name " + name);
    return vswitch;
}

std::unique_ptr<Gantry::Network::PortGroup> FindPortGroup(std::string const& name, Output& output) {
    std::unique_ptr<Gantry::Network::PortGroup> portGroup(Gantry::Network::NetworkFactory::GetPortGroupByName(name));
    if (!portGroup) output.SetError("Unable to find a port group with the name " + name);
    return portGroup;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
