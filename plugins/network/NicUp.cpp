#include "NicUp.h"

#include "CommandSupport.h"
#include "NicLookup.h"

namespace KorvexCli {
namespace NetworkNamespace {

NicUp::NicUp() {
    SetDescription("Bring up the specified network device.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> NicUp::GetInputSpecInternal() { return InputSpecOf(kNicToConfigure); }

boost::shared_ptr<OutputSpec> NicUp::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicUp::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    ChangeNicAdminState(networkInfo, input, output, true);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
