#include "IpNetstackInstanceRemove.h"

#include "CommandSupport.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNetstack = Parameter::String("netstack", "N", "The network stack instance").Required();

}  // namespace

IpNetstackInstanceRemove::IpNetstackInstanceRemove() {
    SetDescription("Remove a new Netstack Instance.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpNetstackInstanceRemove::GetInputSpecInternal() { return InputSpecOf(kNetstack); }

boost::shared_ptr<OutputSpec> IpNetstackInstanceRemove::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void IpNetstackInstanceRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        networkInfo.RemoveNetstackInstance(input->GetString(kNetstack), false);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to Remove Netstack Instance. Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
