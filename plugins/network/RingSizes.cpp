#include "RingSizes.h"

#include <memory>
#include <string>

#include "gantry/network/Pnic.h"
#include "gantry/network/PnicParams.h"

namespace KorvexCli {
namespace NetworkNamespace {

void ShowRingSizes(Gantry::Network::NetworkInfo& networkInfo, Input const& input, Output& output,
                   Parameter const& nicName, boost::shared_ptr<MetaStruct> entry, RingSizes sizes) {
    try {
        std::string name = input.GetString(nicName);
        std::unique_ptr<Gantry::Network::Pnic> nic(networkInfo.GetPnicByName(name));
        if (!nic) {
            output.SetError("NIC with name " + name + " not found");
            return;
        }
        Gantry::Network::PnicRingParams preset;
        Gantry::Network::PnicRingParams current;
        nic->GetRingParams(preset, current);
        Gantry::Network::PnicRingParams const& shown = sizes == RingSizes::Preset ? preset : current;
        entry->SetField("RX", shown.rx);
        entry->SetField("RX Mini", shown.rxMini);
        entry->SetField("RX Jumbo", shown.rxJumbo);
        entry->SetField("TX", shown.tx);
        output.SetResult(entry);
        output.Finish();
    } catch (GantryException& e) {
        output.SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
