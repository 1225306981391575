#include "NicCoalesceGet.h"

#include <string>

#include "CommandSupport.h"
#include "PnicSelection.h"
#include "gantry/network/PnicParams.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "The name of pnic to get coalesce parameters");

// The field titles, each spelt once. "TX Maximum frames" has its capital,
// its RX twin none.
constexpr const char* kNic = "NIC";
constexpr const char* kRxUsecs = "RX microseconds";
constexpr const char* kRxMaxFrames = "RX maximum frames";
constexpr const char* kTxUsecs = "TX microseconds";
constexpr const char* kTxMaxFrames = "TX Maximum frames";
constexpr const char* kAdaptiveRx = "Adaptive RX";
constexpr const char* kAdaptiveTx = "Adaptive TX";
constexpr const char* kSampleInterval = "Sample interval seconds";

// Capitalised, unlike the offloads' "on" and "off".
std::string AdaptiveState(bool enabled) { return enabled ? "On" : "Off"; }

}  // namespace

NicCoalesceGet::NicCoalesceGet() {
    SetDescription("Get coalesce parameters");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:CoalesceParams", std::string(kNic) + "," + kRxUsecs + "," + kRxMaxFrames + "," +
                                                           kTxUsecs + "," + kTxMaxFrames + "," + kAdaptiveRx + "," +
                                                           kAdaptiveTx + "," + kSampleInterval);
}

boost::shared_ptr<InputSpec> NicCoalesceGet::GetInputSpecInternal() { return InputSpecOf(kPnet); }

boost::shared_ptr<OutputSpec> NicCoalesceGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicCoalesceGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("CoalesceParams");
    for (const char* title :
         {kNic, kRxUsecs, kRxMaxFrames, kTxUsecs, kTxMaxFrames, kAdaptiveRx, kAdaptiveTx, kSampleInterval})
        result->SetField(title, MetaString::New());
    return result;
}

void NicCoalesceGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::Pnic> nics;
        if (!SelectPnics(networkInfo, *input, *output, kPnet, "Pnic with name ", nics)) return;
        for (Gantry::Network::Pnic* nic : nics) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField(kNic, nic->GetName());
            Gantry::Network::PnicCoalesceParams coalesce;
            nic->GetCoalesceParams(coalesce);
            entry->SetField(kRxUsecs, std::to_string(coalesce.rxUsecs));
            entry->SetField(kRxMaxFrames, std::to_string(coalesce.rxMaxFrames));
            entry->SetField(kTxUsecs, std::to_string(coalesce.txUsecs));
            entry->SetField(kTxMaxFrames, std::to_string(coalesce.txMaxFrames));
            entry->SetField(kSampleInterval, std::to_string(coalesce.sampleInterval));
            entry->SetField(kAdaptiveRx, AdaptiveState(coalesce.adaptiveRx));
            entry->SetField(kAdaptiveTx, AdaptiveState(coalesce.adaptiveTx));
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
