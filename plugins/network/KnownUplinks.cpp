#include "KnownUplinks.h"

#include <algorithm>

#include "CommandSupport.h"
#include "gantry/network/Pnic.h"

namespace KorvexCli {
namespace NetworkNamespace {

std::vector<std::string> PnicNames(Trellis::Network::NetworkInfoImpl& networkInfo) {
    OwnedVector<Gantry::Network::Pnic> pnics(networkInfo.GetPnics());
    std::vector<std::string> names;
    for (Gantry::Network::Pnic* pnic : pnics) names.push_back(pnic->GetName());
    return names;
}

std::vector<std::string> KnownUplinks(std::vector<std::string> uplinks, std::vector<std::string> const& pnicNames) {
    uplinks.erase(std::remove_if(uplinks.begin(), uplinks.end(),
                                 [&](std::string const& uplink) {
                                     return std::find(pnicNames.begin(), pnicNames.end(), uplink) == pnicNames.end();
                                 }),
                  uplinks.end());
    return uplinks;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
