#include "OffloadSettings.h"

#include <memory>

#include "PnicSelection.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Network::Pnic;
using Gantry::Network::PnicOffloadParams;

std::string OnOff(bool enabled) { return enabled ? "on" : "off"; }

void ListOffloadSettings(Trellis::Network::NetworkInfoImpl& networkInfo, Input const& input, Output& output,
                         Parameter const& pnet, boost::shared_ptr<MetaStruct> shape, OffloadEntry const& entry) {
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, shape);
        OwnedVector<Pnic> nics;
        if (!SelectPnics(networkInfo, input, output, pnet, "Pnic with name ", nics)) return;
        for (Pnic* nic : nics) {
            std::string name = nic->GetName();
            PnicOffloadParams offloads;
            nic->GetOffloadParams(offloads);
            result->AddMetaStruct(entry(name, offloads));
        }
        output.SetResult(result);
        output.Finish();
    } catch (GantryException& e) {
        output.SetError(e.GetMessage(0));
    }
}

void SetOffloadSetting(Trellis::Network::NetworkInfoImpl& networkInfo, Input const& input, Output& output,
                       Parameter const& pnet, Parameter const& enable, std::uint8_t mask,
                       std::vector<bool PnicOffloadParams::*> const& fields) {
    try {
        boost::shared_ptr<MetaBool> result = MetaBool::New();
        std::string name = input.GetString(pnet);
        std::unique_ptr<Pnic> nic(networkInfo.GetPnicByName(name));
        if (!nic) {
            output.SetError("Pnic with name " + name + " not found");
            return;
        }
        PnicOffloadParams offloads;
        nic->GetOffloadParams(offloads);
        bool enabled = input.GetInt(enable) != 0;
        offloads.mask = mask;
        for (bool PnicOffloadParams::*field : fields) offloads.*field = enabled;
        nic->SetOffloadParams(offloads);
        output.SetResult(result);
        output.Finish();
    } catch (GantryException& e) {
        output.SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
