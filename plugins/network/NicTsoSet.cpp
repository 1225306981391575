#include "NicTsoSet.h"

#include "CommandSupport.h"
#include "OffloadSettings.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "Name of pnet to set TSO settings.").Required();
const Parameter kEnable = Parameter::Int("enable", "e", "TCP segmentation offload").Range(0, 1).Required();

}  // namespace

NicTsoSet::NicTsoSet() { SetDescription("Set TCP segmentation offload settings on a nic"); }

boost::shared_ptr<InputSpec> NicTsoSet::GetInputSpecInternal() { return InputSpecOf(kPnet, kEnable); }

boost::shared_ptr<OutputSpec> NicTsoSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicTsoSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    using Gantry::Network::PnicOffloadParams;
    Trellis::Network::NetworkInfoImpl networkInfo;
    SetOffloadSetting(networkInfo, *input, *output, kPnet, kEnable, PnicOffloadParams::TSO,
                      {&PnicOffloadParams::tso});
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
