#include "NicCsoGet.h"

#include <string>

#include "CommandSupport.h"
#include "OffloadSettings.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kPnet = Parameter::String("pnet", "n", "The name of pnic to get CSO settings");

}  // namespace

NicCsoGet::NicCsoGet() {
    SetDescription("Get checksum offload settings");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:CSOSettings", "NIC,RX Checksum Offload,TX Checksum Offload");
}

boost::shared_ptr<InputSpec> NicCsoGet::GetInputSpecInternal() { return InputSpecOf(kPnet); }

boost::shared_ptr<OutputSpec> NicCsoGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicCsoGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("CSOSettings");
    result->SetField("NIC", MetaString::New());
    result->SetField("RX Checksum Offload", MetaString::New());
    result->SetField("TX Checksum Offload", MetaString::New());
    return result;
}

void NicCsoGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    ListOffloadSettings(networkInfo, *input, *output, kPnet, GetOutputStructure(),
                        [this](std::string const& nic, Gantry::Network::PnicOffloadParams const& offloads) {
                            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
                            entry->SetField("NIC", nic);
                            entry->SetField("RX Checksum Offload", OnOff(offloads.rxChecksum));
                            entry->SetField("TX Checksum Offload", OnOff(offloads.txChecksum));
                            return entry;
                        });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
