#include "IpIpsecSPRemove.h"

#include "CommandSupport.h"
#include "trellis/network/IpSecConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kName = Parameter::String("sp-name", "n", "Name for the Security Policy to be removed.");
const Parameter kRemoveAll = Parameter::Flag("remove-all", "a", "Set to remove all Security Policys");

}  // namespace

IpIpsecSPRemove::IpIpsecSPRemove() {
    SetDescription("Operation to remove Security Policy");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpIpsecSPRemove::GetInputSpecInternal() { return InputSpecOf(kName, kRemoveAll); }

boost::shared_ptr<OutputSpec> IpIpsecSPRemove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpIpsecSPRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::IpSecConfigImpl ipsecConfig;
    try {
        bool all = input->GetFlag(kRemoveAll);
        if (all == input->HasParameter(kName)) {
            // Reported, and still answered with true though nothing is removed.
            output->SetError("You should specify exactly one of : --remove-all, --sa-name");
        } else if (all) {
            ipsecConfig.FlushSPDConfig();
        } else {
            ipsecConfig.RemoveSPDConfig(input->GetString(kName));
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
