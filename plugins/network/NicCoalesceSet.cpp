#include "NicCoalesceSet.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/PnicParams.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

// Each parameter's name is spelt once, in its declaration, which the
// specification and the logic share.
const Parameter kPnet = Parameter::String("pnet", "n", "Name of pnet to set coalesce parameters.").Required();
const Parameter kRxUsecs = Parameter::Int("rx-usecs", "r",
                                          "Number of microseconds driver to wait for RX before interrupting.");
const Parameter kRxMaxFrames = Parameter::Int(
    "rx-max-frames", "R", "Maximum number of RX frames driver to process before interrupting.");
const Parameter kTxUsecs = Parameter::Int(
    "tx-usecs", "t", "Number of microseconds driver to wait for completed TX before interrupting.");
const Parameter kTxMaxFrames = Parameter::Int(
    "tx-max-frames", "T", "Maximum number of completed TX frames driver to process before interrupting.");
const Parameter kAdaptiveRx =
    Parameter::Bool("adaptive-rx", "a", "enable or disable adaptive RX algorithm in driver.");
const Parameter kAdaptiveTx =
    Parameter::Bool("adaptive-tx", "A", "enable or disable adaptive TX algorithm in driver.");
const Parameter kSampleInterval =
    Parameter::Int("sample-interval", "i",
                   "Packet rate sampling internal in seconds for the adaptive coalescing algorithm in driver.")
        .Range(1, 3600);

}  // namespace

NicCoalesceSet::NicCoalesceSet() { SetDescription("Set coalesce parameters on a nic"); }

boost::shared_ptr<InputSpec> NicCoalesceSet::GetInputSpecInternal() {
    return InputSpecOf(kPnet, kRxUsecs, kRxMaxFrames, kTxUsecs, kTxMaxFrames, kAdaptiveRx, kAdaptiveTx,
                       kSampleInterval);
}

boost::shared_ptr<OutputSpec> NicCoalesceSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicCoalesceSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        boost::shared_ptr<MetaBool> result = MetaBool::New();
        std::string name = input->GetString(kPnet);
        std::unique_ptr<Gantry::Network::Pnic> nic(networkInfo.GetPnicByName(name));
        if (!nic) {
            output->SetError("Pnic with name " + name + " not found");
            return;
        }
        // What is not given goes back as read.
        Gantry::Network::PnicCoalesceParams coalesce;
        nic->GetCoalesceParams(coalesce);
        if (input->HasParameter(kRxUsecs)) coalesce.rxUsecs = input->GetInt(kRxUsecs);
        if (input->HasParameter(kRxMaxFrames)) coalesce.rxMaxFrames = input->GetInt(kRxMaxFrames);
        if (input->HasParameter(kTxUsecs)) coalesce.txUsecs = input->GetInt(kTxUsecs);
        if (input->HasParameter(kTxMaxFrames)) coalesce.txMaxFrames = input->GetInt(kTxMaxFrames);
        if (input->HasParameter(kAdaptiveRx)) coalesce.adaptiveRx = input->GetBool(kAdaptiveRx);
        if (input->HasParameter(kAdaptiveTx)) coalesce.adaptiveTx = input->GetBool(kAdaptiveTx);
        if (input->HasParameter(kSampleInterval)) coalesce.sampleInterval = input->GetInt(kSampleInterval);
        nic->SetCoalesceParams(coalesce);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
