#include "InterfaceLookup.h"

namespace KorvexCli {
namespace NetworkNamespace {

std::unique_ptr<Gantry::Network::TslNic> FindInterface(Trellis::Network::TesselNicInfoImpl& nicInfo, Output& output,
                                                       std::string const& name) {
    std::unique_ptr<Gantry::Network::TslNic> nic(nicInfo.GetTesselNicByInterface(name, false));
    if (!nic) output.SetError("Unable to find a Tessel interface with the name " + name);
    return nic;
}

bool SelectInterfaces(Trellis::Network::TesselNicInfoImpl& nicInfo, Output& output, std::string const& name,
                      std::string const& netstack, OwnedVector<Gantry::Network::TslNic>& nics) {
    if (!name.empty()) {
        std::unique_ptr<Gantry::Network::TslNic> nic = FindInterface(nicInfo, output, name);
        if (!nic) return false;
        nics.Add(nic.release());
    } else if (netstack.empty()) {
        nics = nicInfo.GetTesselNics();
    } else {
        nics = nicInfo.GetTesselNicsByInstanceKey(netstack);
    }
    return true;
}

Gantry::Network::TslNic* InterfaceNamed(OwnedVector<Gantry::Network::TslNic> const& nics, std::string const& name) {
    for (Gantry::Network::TslNic* nic : nics)
        if (nic->GetName() == name) return nic;
    return nullptr;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
