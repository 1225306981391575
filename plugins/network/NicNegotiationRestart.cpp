#include "NicNegotiationRestart.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/Pnic.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "Name of pnet to restart negotiation").Required();

}  // namespace

// The command sets no kind.
NicNegotiationRestart::NicNegotiationRestart() { SetDescription("Restart N-Way negotiation on a nic"); }

boost::shared_ptr<InputSpec> NicNegotiationRestart::GetInputSpecInternal() { return InputSpecOf(kPnet); }

boost::shared_ptr<OutputSpec> NicNegotiationRestart::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaBool::New());
}

void NicNegotiationRestart::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    // Delivered as made, in its default state (false), never set to true.
    boost::shared_ptr<MetaBool> result = MetaBool::New();
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        std::string name = input->GetString(kPnet);
        std::unique_ptr<Gantry::Network::Pnic> pnic(networkInfo.GetPnicByName(name));
        if (!pnic) {
            output->SetError("Pnic with name " + name + " not found");
            return;
        }
        pnic->RestartNegotiation();
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
