#include "InterfaceConnectionPoint.h"

#include <ctime>

#include "gantry/network/DVPortParam.h"
#include "gantry/network/DVSwitch.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/Portset.h"
#include "trellis/network/DVPortImpl.h"
#include "trellis/network/DVSwitchImpl.h"
#include "trellis/network/PortGroupImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

const Parameter kInterfaceDvsName =
    Parameter::String("dvs-name", "s",
                      "DVSwitch name of the connection point. This requires --dvport-id to be given in the same command");
const Parameter kInterfaceDvPortId =
    Parameter::String("dvport-id", "P",
                      "DVPort ID of the connection point. This requires --dvs-name to be given in the same command");

namespace {

std::unique_ptr<Gantry::Network::ConnectionPoint> PortGroupPoint(Input& input, Output& output,
                                                                 std::string const& portGroupOption) {
    std::string name = input.GetString(portGroupOption);
    try {
        return std::make_unique<Trellis::Network::PortGroupImpl>(name);
    } catch (GantryException& e) {
        output.SetError("Invalid vswitch port group name " + name + ". Error was: " + e.GetMessage(0));
        return nullptr;
    }
}

std::unique_ptr<Gantry::Network::ConnectionPoint> DVPortPoint(Input& input, Output& output) {
    std::string dvsName = input.GetString(kInterfaceDvsName);
    try {
        std::unique_ptr<Gantry::Network::DVSwitch> dvSwitch(
            Gantry::Network::NetworkFactory::GetDVSwitchByName(dvsName));
        // A handle on a switch that does not exist fails at GetId with the
        // host's text.
        if (!dvSwitch)
            dvSwitch = std::make_unique<Trellis::Network::DVSwitchImpl>(dvsName,
                                                                        Gantry::Network::Portset::DEF_NUM_PORTS);
        Gantry::Network::DVPortParam param;
        param.dvsId = dvSwitch->GetId();
        param.portId = input.GetString(kInterfaceDvPortId);
        param.connectionId = 0;
        Trellis::Network::DVPortImpl port(param);
        if (port.IsValid()) {
            if (port.GetConnectionId() == 0) port.SetConnectionId(static_cast<unsigned int>(std::time(nullptr)));
            param.connectionId = port.GetConnectionId();
        }
        return std::make_unique<Trellis::Network::DVPortImpl>(param);
    } catch (GantryException& e) {
        output.SetError("Unable to retrieve DVS info by specified DVS name " + dvsName + ". Error was: " +
                        e.GetMessage(0));
        return nullptr;
    }
}

}  // namespace

bool NamesOneConnectionPoint(Input& input, Output& output, std::string const& portGroupOption) {
    bool portGroup = input.HasParameter(portGroupOption);
    bool dvsName = input.HasParameter(kInterfaceDvsName);
    bool dvPortId = input.HasParameter(kInterfaceDvPortId);
    if (dvsName != dvPortId || (!portGroup && !dvsName)) {
        output.SetError(
            "A connection point of either vswitch port group name or dvs-name/dvport-id should be specified. If "
            "connection point is DVPort, --dvs-name and --dvport-id must be specified at the same time.");
        return false;
    }
    if (portGroup && dvsName) {
        output.SetError("Only one connection point can be specified, vswitch port group or DVPort.");
        return false;
    }
    return true;
}

std::unique_ptr<Gantry::Network::ConnectionPoint> MakeConnectionPoint(Input& input, Output& output,
                                                                      std::string const& portGroupOption) {
    std::unique_ptr<Gantry::Network::ConnectionPoint> point = input.HasParameter(portGroupOption)
                                                                  ? PortGroupPoint(input, output, portGroupOption)
                                                                  : DVPortPoint(input, output);
    if (point && !point->IsValid()) {
        output.SetError("Invalid vswitch port group or DVPort parameters.");
        return nullptr;
    }
    return point;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
