#include "NicSoftwareSet.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "SoftwareFeatures.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet =
    Parameter::String("pnet", "n", "Name of the pnet whose software similation settings should be updated.")
        .Required();

}  // namespace

NicSoftwareSet::NicSoftwareSet() { SetDescription("Enable and disable software simulation settings on a NIC."); }

boost::shared_ptr<InputSpec> NicSoftwareSet::GetInputSpecInternal() {
    boost::shared_ptr<InputSpec> inputSpec = InputSpecOf(kPnet);
    for (SoftwareFeature const& feature : SoftwareFeatures()) inputSpec->AddParameter(feature.parameter.NewSpec());
    return inputSpec;
}

boost::shared_ptr<OutputSpec> NicSoftwareSet::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void NicSoftwareSet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    boost::shared_ptr<MetaBool> result = MetaBool::New();
    // The host's inventory is the first object: its failure is not handled here.
    std::unique_ptr<Gantry::Network::NetworkInfo> networkInfo(Gantry::Network::NetworkFactory::GetNetworkInfo());
    try {
        std::string name = input->GetString(kPnet);
        std::unique_ptr<Gantry::Network::Pnic> nic(networkInfo->GetPnicByName(name));
        if (!nic) {
            output->SetError("Pnic with name " + name + " not found");
            return;
        }
        // Only the features given change: the present settings are not read.
        Gantry::Network::PnicSoftwareParams software;
        for (SoftwareFeature const& feature : SoftwareFeatures()) {
            if (!input->HasParameter(feature.parameter)) continue;
            software.mask |= feature.bit;
            software.*feature.value = input->GetBool(feature.parameter);
        }
        if (software.mask != 0) nic->SetSoftwareParams(software);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
