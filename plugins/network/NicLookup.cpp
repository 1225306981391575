#include "NicLookup.h"

namespace KorvexCli {
namespace NetworkNamespace {

const Parameter kNicToConfigure =
    Parameter::String("nic-name", "n",
                      "The name of the NIC to configured. This must be one of the cards listed in the nic list "
                      "command.")
        .Required();

std::unique_ptr<Gantry::Network::Pnic> FindPnic(Trellis::Network::NetworkInfoImpl& networkInfo, Output& output,
                                                std::string const& name) {
    std::unique_ptr<Gantry::Network::Pnic> pnic(networkInfo.GetPnicByName(name));
    if (!pnic) output.SetError("There is no pnic with name " + name);
    return pnic;
}

void ChangeNicAdminState(Trellis::Network::NetworkInfoImpl& networkInfo, boost::shared_ptr<Input> input,
                         boost::shared_ptr<Output> output, bool up) {
    try {
        std::unique_ptr<Gantry::Network::Pnic> pnic = FindPnic(networkInfo, *output, input->GetString(kNicToConfigure));
        if (!pnic) return;
        pnic->SetAdminUp(up);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
