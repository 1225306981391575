#include "IpDNSServerRemove.h"

#include <memory>
#include <string>

#include "CommandSupport.h"
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
    Trellis::Network::DnsConfigImpl dnsConfig(ChosenNetstack(*input));
    try {
        bool all = input->GetFlag(kAll);
        if (all == input->HasParameter(kServer)) {
            output->SetError("You must specify exactly one of: --all, --server");
            return;
        }
        if (all) {
            dnsConfig.RemoveNameServers();
        } else {
            std::string server = input->GetString(kServer);
            std::unique_ptr<Gantry::Network::IpAddress> address = ParseNameServer(server);
            if (!address) {
                output->SetError(UnrecognisedAddressText(server));
                return;
            }
            dnsConfig.RemoveNameServer(*address);
        }
        dnsConfig.SaveConfig();
    } catch (GantryException& e) {
        // A refused change is reported and still answered with true.
        output->SetError(e.GetMessage(0));
    }
    output->SetResult(MetaBool::New(true));
    output->Finish();
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
