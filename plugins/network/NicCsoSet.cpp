#include "NicCsoSet.h"

#include "CommandSupport.h"
#include "OffloadSettings.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "Name of pnet to set offload settings.").Required();
const Parameter kEnable = Parameter::Int("enable", "e", "RX/TX checksum offload").Range(0, 1).Required();

}  // namespace

NicCsoSet::NicCsoSet() { SetDescription("Set checksum offload settings on a nic"); }

boost::shared_ptr<InputSpec> NicCsoSet::GetInputSpecInternal() { return InputSpecOf(kPnet, kEnable); }

boost::shared_ptr<OutputSpec> NicCsoSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicCsoSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    using Gantry::Network::PnicOffloadParams;
    Trellis::Network::NetworkInfoImpl networkInfo;
    // RX and TX always together, with the one value.
    SetOffloadSetting(networkInfo, *input, *output, kPnet, kEnable,
                      PnicOffloadParams::RX_CHECKSUM | PnicOffloadParams::TX_CHECKSUM,
                      {&PnicOffloadParams::rxChecksum, &PnicOffloadParams::txChecksum});
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
