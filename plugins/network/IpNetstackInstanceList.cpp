#include "IpNetstackInstanceList.h"

#include "CommandSupport.h"
#include "gantry/network/NetstackInstance.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

IpNetstackInstanceList::IpNetstackInstanceList() {
    SetDescription("This command will list the Tessel Netstack instances currently known to the system.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:NetstackInstance", "%Key%");
    SetDefaultOutputParameter("fields:NetstackInstance", "Key,Name,State");
}

boost::shared_ptr<InputSpec> IpNetstackInstanceList::GetInputSpecInternal() { return InputSpec::New(); }

boost::shared_ptr<OutputSpec> IpNetstackInstanceList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpNetstackInstanceList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NetstackInstance");
    result->SetField("Key", MetaString::New());
    result->SetField("Name", MetaString::New());
    result->SetField("State", MetaInt::New());
    return result;
}

void IpNetstackInstanceList::ExecuteInternal(boost::shared_ptr<Input>, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        OwnedVector<Gantry::Network::NetstackInstance> instances(networkInfo.ListNetstackInstances());
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (Gantry::Network::NetstackInstance* instance : instances) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Key", instance->GetKey());
            entry->SetField("Name", instance->GetName());
            entry->SetField("State", instance->GetState());
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
