#include "NicList.h"

#include <memory>

#include "CommandSupport.h"
#include "NicInventoryRow.h"
#include "gantry/network/NetworkFactory.h"
#include "gantry/network/NetworkInfo.h"

namespace KorvexCli {
namespace NetworkNamespace {

NicList::NicList() {
    SetDescription("This command will list the Physical NICs currently installed and loaded on the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:Nic",
                              "Name,PCI Device,Driver,Admin Status,Link Status,Speed,Duplex,MAC Address,MTU,Description");
}

boost::shared_ptr<InputSpec> NicList::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> NicList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> NicList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Nic");
    result->SetField("Name", MetaString::New());
    result->SetField("PCI Device", MetaString::New());
    result->SetField("Driver", MetaString::New());
    result->SetField("Link", MetaString::New());
    result->SetField("Admin Status", MetaString::New());
    result->SetField("Link Status", MetaString::New());
    result->SetField("Speed", MetaInt::New());
    result->SetField("Duplex", MetaString::New());
    result->SetField("MAC Address", MetaString::New());
    result->SetField("MTU", MetaInt::New());
    result->SetField("Description", MetaString::New());
    return result;
}

void NicList::ExecuteInternal(boost::shared_ptr<Input> /*input*/, boost::shared_ptr<Output> output) {
    try {
        std::unique_ptr<Gantry::Network::NetworkInfo> networkInfo(Gantry::Network::NetworkFactory::GetNetworkInfo());
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::Pnic> pnics(networkInfo->GetPnics());
        for (Gantry::Network::Pnic* pnic : pnics) {
            if (pnic == nullptr) continue;
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            FillNicInventoryRow(*entry, *pnic, true);
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
