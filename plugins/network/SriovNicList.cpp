#include "SriovNicList.h"

#include "CommandSupport.h"
#include "NicInventoryRow.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

SriovNicList::SriovNicList() {
    SetDescription(
        "This command will list the SRIOV Enabled NICs (PFs) currently installed and loaded on the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:SriovNic",
                              "Name,PCI Device,Driver,Link,Speed,Duplex,MAC Address,MTU,Description");
}

boost::shared_ptr<InputSpec> SriovNicList::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> SriovNicList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> SriovNicList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("SriovNic");
    result->SetField("Name", MetaString::New());
    result->SetField("PCI Device", MetaString::New());
    result->SetField("Driver", MetaString::New());
    result->SetField("Link", MetaString::New());
    result->SetField("Speed", MetaInt::New());
    result->SetField("Duplex", MetaString::New());
    result->SetField("MAC Address", MetaString::New());
    result->SetField("MTU", MetaInt::New());
    result->SetField("Description", MetaString::New());
    return result;
}

void SriovNicList::ExecuteInternal(boost::shared_ptr<Input>, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::Pnic> nics(networkInfo.GetSriovNics());
        for (Gantry::Network::Pnic* nic : nics) {
            if (!nic) continue;
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            FillNicInventoryRow(*entry, *nic, false);
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to list NICs.  Error was " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
