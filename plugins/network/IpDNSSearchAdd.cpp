#include "IpDNSSearchAdd.h"

#include "CommandSupport.h"
#include "DnsEdit.h"
#include "NetstackChoice.h"
#include "trellis/network/DnsConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kDomain =
    Parameter::String("domain", "d", "The string name of a domain to add to the list of search domains.").Required();

}  // namespace

IpDNSSearchAdd::IpDNSSearchAdd() {
    SetDescription(
        "Add a search domain to the list of domains to be searched when trying to resolve an host name on the Halden "
        "host.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpDNSSearchAdd::GetInputSpecInternal() {
    return InputSpecOf(kDomain, kNetstackOrDefault);
}

boost::shared_ptr<OutputSpec> IpDNSSearchAdd::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpDNSSearchAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RunDnsEdit(*input, *output, [&](Trellis::Network::DnsConfigImpl& dnsConfig) {
        // The host judges the domain's form.
        dnsConfig.AddSearchDomain(input->GetString(kDomain));
        return true;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
