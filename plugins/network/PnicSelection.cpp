#include "PnicSelection.h"

namespace KorvexCli {
namespace NetworkNamespace {

bool SelectPnics(Gantry::Network::NetworkInfo& networkInfo, Input const& input, Output& output,
                 std::string const& nameParameter, std::string const& unknownNic,
                 OwnedVector<Gantry::Network::Pnic>& nics) {
    if (!input.HasParameter(nameParameter)) {
        nics = networkInfo.GetPnics();
        return true;
    }
    std::string name = input.GetString(nameParameter);
    Gantry::Network::Pnic* nic = networkInfo.GetPnicByName(name);
    if (!nic) {
        output.SetError(unknownNic + name + " not found");
        return false;
    }
    nics.Add(nic);
    return true;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
