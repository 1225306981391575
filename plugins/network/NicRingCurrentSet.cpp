#include "NicRingCurrentSet.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"
#include "gantry/network/PnicParams.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNicName =
    Parameter::String("nic-name", "n",
                      "The name of the NIC whose current RX/TX ring buffer parameters should be set.")
        .Required();
const Parameter kRx = Parameter::Int("rx", "r", "Number of ring entries for the RX ring.");
const Parameter kRxMini = Parameter::Int("rx-mini", "m", "Number of ring entries for the RX mini ring.");
const Parameter kRxJumbo = Parameter::Int("rx-jumbo", "j", "Number of ring entries for the RX jumbo ring.");
const Parameter kTx = Parameter::Int("tx", "t", "Number of ring entries for the TX ring.");

}  // namespace

NicRingCurrentSet::NicRingCurrentSet() {
    SetDescription("Set current RX/TX ring buffer parameters of a NIC");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> NicRingCurrentSet::GetInputSpecInternal() {
    return InputSpecOf(kNicName, kRx, kRxMini, kRxJumbo, kTx);
}

boost::shared_ptr<OutputSpec> NicRingCurrentSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicRingCurrentSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    using Gantry::Network::PnicRingParams;
    boost::shared_ptr<MetaBool> result = MetaBool::New();
    // The host's inventory is the first object: its failure is not handled here.
    std::unique_ptr<Gantry::Network::NetworkInfo> networkInfo(Gantry::Network::NetworkFactory::GetNetworkInfo());
    try {
        std::string name = input->GetString(kNicName);
        std::unique_ptr<Gantry::Network::Pnic> nic(networkInfo->GetPnicByName(name));
        if (!nic) {
            output->SetError("NIC with name " + name + " not found");
            return;
        }
        // Only the rings given change; sizes beyond the presets are the
        // device's to refuse.
        PnicRingParams rings;
        if (input->HasParameter(kRx)) {
            rings.mask |= PnicRingParams::RX;
            rings.rx = input->GetInt(kRx);
        }
        if (input->HasParameter(kRxMini)) {
            rings.mask |= PnicRingParams::RX_MINI;
            rings.rxMini = input->GetInt(kRxMini);
        }
        if (input->HasParameter(kRxJumbo)) {
            rings.mask |= PnicRingParams::RX_JUMBO;
            rings.rxJumbo = input->GetInt(kRxJumbo);
        }
        if (input->HasParameter(kTx)) {
            rings.mask |= PnicRingParams::TX;
            rings.tx = input->GetInt(kTx);
        }
        if (rings.mask != 0) nic->SetRingParams(rings);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
