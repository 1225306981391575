#include "NicPauseParamsSet.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"
#include "gantry/network/PnicParams.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNicName =
    Parameter::String("nic-name", "n", "Name of NIC whose pause parameters should be set.").Required();
const Parameter kAuto = Parameter::Bool("auto", "a", "Enable/disable auto negotiation.");
const Parameter kRx = Parameter::Bool("rx", "r", "Enable/disable pause RX flow control.");
const Parameter kTx = Parameter::Bool("tx", "t", "Enable/disable pause TX flow control.");

}  // namespace

NicPauseParamsSet::NicPauseParamsSet() {
    SetDescription("Set pause parameters for a NIC");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> NicPauseParamsSet::GetInputSpecInternal() {
    return InputSpecOf(kNicName, kAuto, kRx, kTx);
}

boost::shared_ptr<OutputSpec> NicPauseParamsSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicPauseParamsSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    boost::shared_ptr<MetaBool> result = MetaBool::New();
    // The host's inventory is the first object: its failure is not handled here.
    std::unique_ptr<Gantry::Network::NetworkInfo> networkInfo(Gantry::Network::NetworkFactory::GetNetworkInfo());
    try {
        std::string name = input->GetString(kNicName);
        std::unique_ptr<Gantry::Network::Pnic> nic(networkInfo->GetPnicByName(name));
        if (!nic) {
            output->SetError("NIC with name " + name + " not found");
            return;
        }
        // What is not given goes back as read; whether the NIC supports pause
        // frames is the device's to decide.
        Gantry::Network::PnicPauseParams pause;
        nic->GetPauseParams(pause);
        if (input->HasParameter(kAuto)) pause.autonegotiate = input->GetBool(kAuto);
        if (input->HasParameter(kRx)) pause.rx = input->GetBool(kRx);
        if (input->HasParameter(kTx)) pause.tx = input->GetBool(kTx);
        nic->SetPauseParams(pause);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
