#include "LacpSwitches.h"

#include <string>
#include <vector>

#include "gantry/network/NetworkFactory.h"
#include "trellis/lib/TrellisException.h"
#include "trellis/network/VirtualSwitchInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

const Parameter kLacpSwitchName = Parameter::String("dvs", "s", "The name of DVS to get configuration on");

bool FindLacpSwitches(Input& input, Output& output, OwnedVector<Gantry::Network::DVSwitch>& switches) {
    if (input.HasParameter(kLacpSwitchName)) {
        switches.Add(Gantry::Network::NetworkFactory::GetDVSwitchByName(input.GetString(kLacpSwitchName)));
        return true;
    }
    Trellis::Network::VirtualSwitchInfoImpl vswitchInfo;
    switches = vswitchInfo.GetDVSwitches();
    if (switches.Items().empty()) {
        output.SetError("LACP is supported on Korvex DVSwitch only, and there is no DVSwitch configured on host.");
        return false;
    }
    return true;
}

std::size_t ForEachLacpGroup(Gantry::Network::DVSwitch& dvSwitch, char const* sourceFile, unsigned int line,
                             std::function<void(Gantry::Network::LacpGroup&)> const& visit) {
    std::vector<Gantry::Network::LacpGroup*>* groups = dvSwitch.GetLacpGroups();
    if (groups == nullptr) return 0;
    std::size_t count = groups->size();
    try {
        for (Gantry::Network::LacpGroup* group : *groups) visit(*group);
    } catch (GantryException& e) {
        std::string message = e.GetMessage(0);
        dvSwitch.FreeLacpGroups(groups);
        throw Trellis::Lib::TrellisException(message, sourceFile, line);
    }
    dvSwitch.FreeLacpGroups(groups);
    return count;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
