#include "IpNetstackInstanceAdd.h"

#include <string>

#include "CommandSupport.h"
#include "trellis/network/NetstackInstanceImpl.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNetstack = Parameter::String("netstack", "N", "The network stack instance").Required();
const Parameter kDisabled = Parameter::Flag(
    "disabled", "d",
    "Create the netstack instance only in config i.e. in disabled state. Does not create in kernel.");

// What every new instance starts with; network ip netstack set changes it.
const unsigned int kDefaultMaxConnections = 11000;
const char* const kDefaultCongestionControl = "newreno";

}  // namespace

IpNetstackInstanceAdd::IpNetstackInstanceAdd() {
    SetDescription("Add a new Netstack Instance.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpNetstackInstanceAdd::GetInputSpecInternal() {
    return InputSpecOf(kNetstack, kDisabled);
}

boost::shared_ptr<OutputSpec> IpNetstackInstanceAdd::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void IpNetstackInstanceAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        Trellis::Network::NetstackInstanceImpl instance(input->GetString(kNetstack), kDefaultMaxConnections,
                                                        kDefaultCongestionControl, true, 2);
        networkInfo.AddNetstackInstance(&instance, input->HasParameter(kDisabled));
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to add Netstack Instance. Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
