#include "IpDNSServerAdd.h"

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

const Parameter kServer =
    Parameter::String("server", "s", "The IP address (v4 or v6) of the DNS server to add to the DNS server list.")
        .Required();

}  // namespace

IpDNSServerAdd::IpDNSServerAdd() {
    SetDescription("Add a new DNS server to the end of the list of DNS servers to use for this Halden host.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpDNSServerAdd::GetInputSpecInternal() {
    return InputSpecOf(kServer, kNetstackOrDefault);
}

boost::shared_ptr<OutputSpec> IpDNSServerAdd::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpDNSServerAdd::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RunDnsEdit(*input, *output, [&](Trellis::Network::DnsConfigImpl& dnsConfig) {
        std::string server = input->GetString(kServer);
        std::unique_ptr<Gantry::Network::IpAddress> address = ParseNameServer(server);
        if (!address) {
            output->SetError(UnrecognisedAddressText(server));
            return false;
        }
        dnsConfig.AddNameServer(*address);
        return true;
    });
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
