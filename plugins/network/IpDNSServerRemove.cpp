#include "IpDNSServerRemove.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
#include "DnsEdit.h"
#include "NameServerAddress.h"
#include "NetstackChoice.h"
#include "trellis/network/DnsConfigImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kAll = Parameter::Flag("all", "a", "");
// Required as declared, so the tool refuses --all alone.
const Parameter kServer = Parameter::String("server", "s", "").Required();

}  // namespace

IpDNSServerRemove::IpDNSServerRemove() {
    SetDescription("Remove a DNS server from the list of DNS servers to use for this Halden host.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpDNSServerRemove::GetInputSpecInternal() {
    return InputSpecOf(kAll, kServer, kNetstackOrDefault);
}

boost::shared_ptr<OutputSpec> IpDNSServerRemove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpDNSServerRemove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RunDnsEdit(*input, *output, [&](Trellis::Network::DnsConfigImpl& dnsConfig) {
        bool all = input->GetFlag(kAll);
        if (all == input->HasParameter(kServer)) {
            output->SetError("You must specify exactly one of: --all, --server");
            return false;
        }
        if (all) {
            dnsConfig.RemoveNameServers();
            return true;
        }
        std::string server = input->GetString(kServer);
        std::unique_ptr<Gantry::Network::IpAddress> address = ParseNameServer(server);
        if (!address) {
            output->SetError(UnrecognisedAddressText(server));
            return false;
        }
        dnsConfig.RemoveNameServer(*address);
        return true;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
