#include "NicTsoGet.h"

#include <string>

#include "CommandSupport.h"
#include "OffloadSettings.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "The name of pnic to get TSO settings");

}  // namespace

NicTsoGet::NicTsoGet() {
    SetDescription("Get TCP segmentation offload settings");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:TSOSettings", "NIC,Value");
}

boost::shared_ptr<InputSpec> NicTsoGet::GetInputSpecInternal() { return InputSpecOf(kPnet); }

boost::shared_ptr<OutputSpec> NicTsoGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicTsoGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("TSOSettings");
    result->SetField("NIC", MetaString::New());
    result->SetField("Value", MetaString::New());
    return result;
}

void NicTsoGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    ListOffloadSettings(networkInfo, *input, *output, kPnet, GetOutputStructure(),
                        [this](std::string const& nic, Gantry::Network::PnicOffloadParams const& offloads) {
                            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
                            entry->SetField("NIC", nic);
                            entry->SetField("Value", OnOff(offloads.tso));
                            return entry;
                        });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
