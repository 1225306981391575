#include "NicDown.h"

#include "CommandSupport.h"
#include "NicLookup.h"

namespace KorvexCli {
namespace NetworkNamespace {

NicDown::NicDown() {
    SetDescription("Bring down the specified network device.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> NicDown::GetInputSpecInternal() { return InputSpecOf(kNicToConfigure); }

boost::shared_ptr<OutputSpec> NicDown::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicDown::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    ChangeNicAdminState(networkInfo, input, output, false);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
