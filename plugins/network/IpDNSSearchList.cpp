#include "IpDNSSearchList.h"

#include <string>
#include <vector>

#include "CommandSupport.h"
#include "NetstackChoice.h"
#include "trellis/network/DnsConfigImpl.h"
#include "trellis/util/StringTokenize.h"

namespace KorvexCli {
namespace NetworkNamespace {

IpDNSSearchList::IpDNSSearchList() {
    SetDescription(
        "List the search domains currently configured on the Halden host in the order in which they will be used "
        "when searching.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("simple");
}

boost::shared_ptr<InputSpec> IpDNSSearchList::GetInputSpecInternal() { return InputSpecOf(kNetstackOrDefault); }

boost::shared_ptr<OutputSpec> IpDNSSearchList::GetOutputSpecInternal() {
    return OutputSpec::Of(GetOutputStructure());
}

boost::shared_ptr<MetaStruct> IpDNSSearchList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("DNSSearchList");
    result->SetField("DNS Search Domains", MetaList::New(Plinth::MetaObj::META_STRING));
    return result;
}

void IpDNSSearchList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::DnsConfigImpl dnsConfig(ChosenNetstack(*input));
    try {
        std::vector<std::string> domains;
        Trellis::Util::StringTokenize(dnsConfig.GetSearchDomainsString(), domains, " ");
        boost::shared_ptr<MetaList> list = MetaList::New(Plinth::MetaObj::META_STRING);
        for (std::string const& domain : domains) list->AddString(domain);
        boost::shared_ptr<MetaStruct> result = GetOutputStructure();
        result->SetField("DNS Search Domains", list);
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
