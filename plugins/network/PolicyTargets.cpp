#include "PolicyTargets.h"

#include "gantry/network/NetworkFactory.h"
#include "trellis/network/PortsetImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

void RunOnLegacySwitch(Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo, Input& input, Output& output,
                       Parameter const& vswitchName,
                       std::function<boost::shared_ptr<Plinth::MetaObj::MetaObject>(Gantry::Network::VirtualSwitch&)> const& work) {
    try {
        std::string name = input.GetString(vswitchName);
        std::unique_ptr<Gantry::Network::VirtualSwitch> vswitch;
        if (Trellis::Network::PortsetImpl::IsValidVirtualSwitch(name)) {
            vswitch.reset(vswitchInfo.GetVirtualSwitchByName(name));
        }
        if (!vswitch) {
            output.SetError("Unable to find a legacy virtual switch with the name " + name);
            return;
        }
        boost::shared_ptr<Plinth::MetaObj::MetaObject> result = work(*vswitch);
        output.SetResult(result);
        output.Finish();
    } catch (GantryException& e) {
        output.SetError(e.GetMessage(0));
    }
}

void RunOnPortGroup(Input& input, Output& output, Parameter const& portGroupName,
                    std::function<boost::shared_ptr<Plinth::MetaObj::MetaObject>(Gantry::Network::PortGroup&)> const& work) {
    try {
        std::unique_ptr<Gantry::Network::PortGroup> portGroup = FindPortGroup(input.GetString(portGroupName), output);
        if (!portGroup) return;
        boost::shared_ptr<Plinth::MetaObj::MetaObject> result = work(*portGroup);
        output.SetResult(result);
        output.Finish();
    } catch (GantryException& e) {
        output.SetError(e.GetMessage(0));
    }
}

std::unique_ptr<Gantry::Network::PortGroup> FindPortGroup(std::string const& name, Output& output) {
    std::unique_ptr<Gantry::Network::PortGroup> portGroup(Gantry::Network::NetworkFactory::GetPortGroupByName(name));
    if (!portGroup) output.SetError("Unable to find a port group with the name " + name);
    return portGroup;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
