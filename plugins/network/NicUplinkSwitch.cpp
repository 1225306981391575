#include "NicUplinkSwitch.h"

#include <algorithm>
#include <new>
#include <vector>

#include "gantry/network/Portset.h"
#include "trellis/network/DVSwitchImpl.h"
#include "trellis/network/VirtualSwitchImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

const Parameter kVlanStatsNicName =
    Parameter::String("nic-name", "n", "Name of the NIC to get statistics from.").Required();

UplinkSearch FindUplinkSwitch(Trellis::Network::VirtualSwitchInfoImpl& vswitchInfo, std::string const& nicName,
                              std::unique_ptr<Trellis::Network::PortsetImpl>& found) {
    OwnedVector<Gantry::Network::Portset> switches(vswitchInfo.GetAllSwitches());
    for (Gantry::Network::Portset* listed : switches) {
        std::string name = listed->GetName();
        std::unique_ptr<Trellis::Network::PortsetImpl> portset;
        if (vswitchInfo.IsLegacySwitch(name)) {
            portset.reset(new (std::nothrow)
                              Trellis::Network::VirtualSwitchImpl(name, Gantry::Network::Portset::DEF_NUM_PORTS));
        } else {
            portset.reset(new (std::nothrow)
                              Trellis::Network::DVSwitchImpl(name, Gantry::Network::Portset::DEF_NUM_PORTS));
        }
        if (!portset) return UplinkSearch::OutOfMemory;
        std::vector<std::string> uplinks = portset->GetUplinks();
        if (std::find(uplinks.begin(), uplinks.end(), nicName) != uplinks.end()) {
            found = std::move(portset);
            return UplinkSearch::Found;
        }
    }
    return UplinkSearch::NotFound;
}

std::string NotAnUplinkText(std::string const& nicName) {
    return nicName + " is not a valid NIC connected to any virtual switch.";
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
