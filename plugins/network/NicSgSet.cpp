#include "NicSgSet.h"

#include "CommandSupport.h"
#include "OffloadSettings.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet =
    Parameter::String("pnet", "n", "Name of pnet to configure scatter-gather settings.").Required();
const Parameter kEnable = Parameter::Int("enable", "e", "Enable/disable sacatter-gather").Range(0, 1).Required();

}  // namespace

NicSgSet::NicSgSet() { SetDescription("Set scatter-gatter settings on a nic"); }

boost::shared_ptr<InputSpec> NicSgSet::GetInputSpecInternal() { return InputSpecOf(kPnet, kEnable); }

boost::shared_ptr<OutputSpec> NicSgSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicSgSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    using Gantry::Network::PnicOffloadParams;
    Trellis::Network::NetworkInfoImpl networkInfo;
    SetOffloadSetting(networkInfo, *input, *output, kPnet, kEnable, PnicOffloadParams::SCATTER_GATHER,
                      {&PnicOffloadParams::scatterGather});
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
