#include "NicSoftwareList.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "SoftwareFeatures.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"

namespace KorvexCli {
namespace NetworkNamespace {

NicSoftwareList::NicSoftwareList() {
    SetDescription(
        "List software simulation settings of all physical NICs currently installed and loaded on the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    std::string fields = "NIC";
    for (SoftwareFeature const& feature : SoftwareFeatures()) fields += "," + feature.field;
    SetDefaultOutputParameter("fields:Settings", fields);
}

boost::shared_ptr<InputSpec> NicSoftwareList::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> NicSoftwareList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicSoftwareList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Settings");
    result->SetField("NIC", MetaString::New());
    for (SoftwareFeature const& feature : SoftwareFeatures()) result->SetField(feature.field, MetaString::New());
    return result;
}

void NicSoftwareList::ExecuteInternal(boost::shared_ptr<Input>, boost::shared_ptr<Output> output) {
    // The host's inventory is the first object: its failure is not handled here.
    std::unique_ptr<Gantry::Network::NetworkInfo> networkInfo(Gantry::Network::NetworkFactory::GetNetworkInfo());
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::Pnic> nics(networkInfo->GetPnics());
        for (Gantry::Network::Pnic* nic : nics) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("NIC", nic->GetName());
            Gantry::Network::PnicSoftwareParams software;
            nic->GetSoftwareParams(software);
            for (SoftwareFeature const& feature : SoftwareFeatures())
                entry->SetField(feature.field, software.*feature.value ? "on" : "off");
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
