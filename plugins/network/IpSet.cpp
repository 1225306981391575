#include "IpSet.h"

#include "CommandSupport.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kIpv6Enabled = Parameter::Bool("ipv6-enabled", "e", "Enable or disable IPv6 (Reboot Required)");

}  // namespace

IpSet::IpSet() {
    SetDescription("Update global IP settings");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpSet::GetInputSpecInternal() { return InputSpecOf(kIpv6Enabled); }

boost::shared_ptr<OutputSpec> IpSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        // Without the option the command changes nothing and succeeds.
        if (input->HasParameter(kIpv6Enabled)) networkInfo.SetTslIpv6Enabled(input->GetBool(kIpv6Enabled));
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
