#include "DnsEdit.h"

#include "NetstackChoice.h"

namespace KorvexCli {
namespace NetworkNamespace {

void RunDnsEdit(Input const& input, Output& output,
                std::function<bool(Trellis::Network::DnsConfigImpl&)> const& edit) {
    Trellis::Network::DnsConfigImpl dnsConfig(ChosenNetstack(input));
    try {
        if (!edit(dnsConfig)) return;
        dnsConfig.SaveConfig();
    } catch (GantryException& e) {
        output.SetError(e.GetMessage(0));
    }
    output.SetResult(MetaBool::New(true));
    output.Finish();
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
