#include "NicSgGet.h"

#include <string>

#include "CommandSupport.h"
#include "OffloadSettings.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "The name of pnic to get scatter-gather settings");

}  // namespace

NicSgGet::NicSgGet() {
    SetDescription("Get scatter-gather settings");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:ScatterGatherSetting", "NIC,Value");
}

boost::shared_ptr<InputSpec> NicSgGet::GetInputSpecInternal() { return InputSpecOf(kPnet); }

boost::shared_ptr<OutputSpec> NicSgGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicSgGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("ScatterGatherSetting");
    result->SetField("NIC", MetaString::New());
    result->SetField("Value", MetaString::New());
    return result;
}

void NicSgGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    ListOffloadSettings(networkInfo, *input, *output, kPnet, GetOutputStructure(),
                        [this](std::string const& nic, Gantry::Network::PnicOffloadParams const& offloads) {
                            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
                            entry->SetField("NIC", nic);
                            entry->SetField("Value", OnOff(offloads.scatterGather));
                            return entry;
                        });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
