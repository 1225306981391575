#include "IpDNSSearchRemove.h"

#include "CommandSupport.h"
#include "DnsEdit.h"
#include "NetstackChoice.h"
#include "trellis/network/DnsConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kDomain =
    Parameter::String("domain", "d", "The string name of a domain to remove from the list of search domains.")
        .Required();

}  // namespace

IpDNSSearchRemove::IpDNSSearchRemove() {
    SetDescription(
        "Remove a search domain from the list of domains to be searched when trying to resolve an host name on the "
        "Halden host.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpDNSSearchRemove::GetInputSpecInternal() {
    return InputSpecOf(kDomain, kNetstackOrDefault);
}

boost::shared_ptr<OutputSpec> IpDNSSearchRemove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpDNSSearchRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RunDnsEdit(*input, *output, [&](Trellis::Network::DnsConfigImpl& dnsConfig) {
        dnsConfig.RemoveSearchDomain(input->GetString(kDomain));
        return true;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
