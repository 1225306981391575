#include "IpNetstackInstanceGet.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "gantry/network/NetstackInstance.h"
#include "trellis/network/NetworkInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNetstack = Parameter::String("netstack", "N", "The network stack instance").Required();

}  // namespace

IpNetstackInstanceGet::IpNetstackInstanceGet() {
    SetDescription("Get runtime/configuration settings for a given Netstack Instance.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
    SetDefaultOutputParameter("header:NetstackInstance", "%Key%");
    SetDefaultOutputParameter("fields:NetstackInstance",
                              "Key,Name,Enabled,Max Connections,Current Max Connections,"
                              "Congestion Control Algorithm,IPv6 Enabled,Current IPv6 Enabled,State");
}

boost::shared_ptr<InputSpec> IpNetstackInstanceGet::GetInputSpecInternal() { return InputSpecOf(kNetstack); }

boost::shared_ptr<OutputSpec> IpNetstackInstanceGet::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpNetstackInstanceGet::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NetstackInstance");
    result->SetField("Key", MetaString::New());
    result->SetField("Name", MetaString::New());
    result->SetField("Enabled", MetaBool::New());
    result->SetField("Max Connections", MetaInt::New());
    result->SetField("Current Max Connections", MetaInt::New());
    result->SetField("Congestion Control Algorithm", MetaString::New());
    result->SetField("IPv6 Enabled", MetaBool::New());
    result->SetField("Current IPv6 Enabled", MetaBool::New());
    result->SetField("State", MetaInt::New());
    return result;
}

void IpNetstackInstanceGet::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::NetworkInfoImpl networkInfo;
    try {
        std::string key = input->GetString(kNetstack);
        // A one-element list, though the key names one instance.
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        std::unique_ptr<Gantry::Network::NetstackInstance> instance(networkInfo.LookupNetstackInstanceByKey(key));
        if (!instance) {
            output->SetError("Unable to find a Netstack instance " + key);
            return;
        }
        boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
        entry->SetField("Key", instance->GetKey());
        entry->SetField("Name", instance->GetName());
        entry->SetField("Enabled", instance->GetState() == Gantry::Network::NetstackInstance::STATE_IN_KERNEL);
        entry->SetField("Max Connections", instance->GetMaxConnections());
        entry->SetField("Current Max Connections", instance->GetCurrentMaxConnections());
        entry->SetField("Congestion Control Algorithm", instance->GetCongestionControlAlgorithm());
        entry->SetField("IPv6 Enabled", instance->GetIpv6Enabled());
        entry->SetField("Current IPv6 Enabled", instance->GetCurrentIpv6Enabled());
        entry->SetField("State", instance->GetState());
        result->AddMetaStruct(entry);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(std::string("Error getting Netstack instance configuration. ") + ". Error was : " +
                         e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
