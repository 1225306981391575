#include "NicPauseParamsList.h"

#include <memory>

#include "CommandSupport.h"
#include "PnicSelection.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"
#include "gantry/network/PnicParams.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNicName =
    Parameter::String("nic-name", "n", "The name of the NIC whose pause parameters should be retrieved.");

}  // namespace

NicPauseParamsList::NicPauseParamsList() {
    SetDescription("List pause parameters of all NICs");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:PauseParamsSettings",
                              "NIC,Pause Params Supported,Pause RX,Pause TX,Auto Negotiation,"
                              "Auto Negotiation Resolution Avail,RX Auto Negotiation Resolution,"
                              "TX Auto Negotiation Resolution");
}

boost::shared_ptr<InputSpec> NicPauseParamsList::GetInputSpecInternal() { return InputSpecOf(kNicName); }

boost::shared_ptr<OutputSpec> NicPauseParamsList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicPauseParamsList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("PauseParamsSettings");
    result->SetField("NIC", MetaString::New());
    result->SetField("Pause Params Supported", MetaBool::New());
    result->SetField("Auto Negotiation", MetaBool::New());
    result->SetField("Pause RX", MetaBool::New());
    result->SetField("Pause TX", MetaBool::New());
    result->SetField("Auto Negotiation Resolution Avail", MetaBool::New());
    result->SetField("RX Auto Negotiation Resolution", MetaBool::New());
    result->SetField("TX Auto Negotiation Resolution", MetaBool::New());
    return result;
}

void NicPauseParamsList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    // The host's inventory is the first object: its failure is not handled here.
    std::unique_ptr<Gantry::Network::NetworkInfo> networkInfo(Gantry::Network::NetworkFactory::GetNetworkInfo());
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::Pnic> nics;
        if (!SelectPnics(*networkInfo, *input, *output, kNicName, "NIC with name ", nics)) return;
        for (Gantry::Network::Pnic* nic : nics) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("NIC", nic->GetName());
            Gantry::Network::PnicPauseParams pause;
            nic->GetPauseParams(pause);
            // A resolution of 0 means that negotiation gave none; 1 is pause
            // on in that direction, any other value off.
            bool resolved = pause.supported && pause.rxResolution != 0 && pause.txResolution != 0;
            entry->SetField("Pause Params Supported", pause.supported);
            entry->SetField("Pause RX", pause.supported && pause.rx);
            entry->SetField("Pause TX", pause.supported && pause.tx);
            entry->SetField("Auto Negotiation", pause.supported && pause.autonegotiate);
            entry->SetField("Auto Negotiation Resolution Avail", resolved);
            entry->SetField("RX Auto Negotiation Resolution", resolved && pause.rxResolution == 1);
            entry->SetField("TX Auto Negotiation Resolution", resolved && pause.txResolution == 1);
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
