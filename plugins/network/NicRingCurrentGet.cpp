#include "NicRingCurrentGet.h"

#include <memory>

#include "CommandSupport.h"
#include "RingSizes.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNicName =
    Parameter::String("nic-name", "n",
                      "The name of the NIC whose current RX/TX ring buffer parameters should be retrieved.")
        .Required();

}  // namespace

NicRingCurrentGet::NicRingCurrentGet() {
    SetDescription("Get current RX/TX ring buffer parameters of a NIC");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("fields:RingInfo", "RX,RX Mini,RX Jumbo,TX");
}

boost::shared_ptr<InputSpec> NicRingCurrentGet::GetInputSpecInternal() { return InputSpecOf(kNicName); }

boost::shared_ptr<OutputSpec> NicRingCurrentGet::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> NicRingCurrentGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("RingInfo");
    result->SetField("RX", MetaInt::New());
    result->SetField("RX Mini", MetaInt::New());
    result->SetField("RX Jumbo", MetaInt::New());
    result->SetField("TX", MetaInt::New());
    return result;
}

void NicRingCurrentGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    // The host's inventory is the first object: its failure is not handled here.
    std::unique_ptr<Gantry::Network::NetworkInfo> networkInfo(Gantry::Network::NetworkFactory::GetNetworkInfo());
    ShowRingSizes(*networkInfo, *input, *output, kNicName, GetOutputStructure(), RingSizes::Current);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
