#include "IpDNSServerList.h"

#include <string>

#include "CommandSupport.h"
#include "NetstackChoice.h"
#include "trellis/network/DnsConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

IpDNSServerList::IpDNSServerList() {
    SetDescription(
        "Print a list of the DNS server currently configured on the system in the order in which they will be used.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

boost::shared_ptr<InputSpec> IpDNSServerList::GetInputSpecInternal() { return InputSpecOf(kNetstackOrDefault); }

boost::shared_ptr<OutputSpec> IpDNSServerList::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> IpDNSServerList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("NameServerList");
    result->SetField("DNS Servers", MetaList::New(Plinth::MetaObj::META_STRING));
    return result;
}

void IpDNSServerList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::DnsConfigImpl dnsConfig(ChosenNetstack(*input));
    try {
        boost::shared_ptr<MetaList> servers = MetaList::New(Plinth::MetaObj::META_STRING);
        for (std::string const& server : dnsConfig.GetNameServers()) servers->AddString(server);
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        result->SetField("DNS Servers", servers);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
