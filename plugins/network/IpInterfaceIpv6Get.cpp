#include "IpInterfaceIpv6Get.h"

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "gantry/network/IpConfig.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

// "n", where the other interface commands say "i".
const Parameter kInterfaceName = Parameter::String(
    "interface-name", "n", "The name of the Tessel network interface to limit the output of this command to.");
const Parameter kNetstack = Parameter::String(
    "netstack", "N", "The network stack instance; if unspecified, consider all netstack instances");

}  // namespace

IpInterfaceIpv6Get::IpInterfaceIpv6Get() {
    SetDescription(
        "Get IPv6 settings for Tessel network interfaces. This does not include the IPv6 addresses which can be "
        "found in the listipv6 command");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:IPv6Interface", "Name,DHCPv6 Enabled,Router Adv Enabled,DHCP DNS");
}

boost::shared_ptr<InputSpec> IpInterfaceIpv6Get::GetInputSpecInternal() {
    return InputSpecOf(kInterfaceName, kNetstack);
}

boost::shared_ptr<OutputSpec> IpInterfaceIpv6Get::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpInterfaceIpv6Get::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("IPv6Interface");
    result->SetField("Name", MetaString::New());
    result->SetField("DHCPv6 Enabled", MetaBool::New());
    result->SetField("Router Adv Enabled", MetaBool::New());
    result->SetField("DHCP DNS", MetaBool::New());
    return result;
}

void IpInterfaceIpv6Get::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    std::string name = input->GetString(kInterfaceName);
    // A name wins over a netstack.
    std::string netstack = name.empty() ? input->GetString(kNetstack) : "";
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::TslNic> nics;
        if (!SelectInterfaces(nicInfo, *output, name, netstack, nics)) return;
        for (Gantry::Network::TslNic* nic : nics) {
            Gantry::Network::IpConfig config = nic->GetIpConfig();
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Name", nic->GetName());
            entry->SetField("DHCPv6 Enabled", config.GetUseIpv6Dhcp());
            entry->SetField("Router Adv Enabled", config.GetUseIpv6RouterAdvertised());
            entry->SetField("DHCP DNS", config.GetUseIpv6Dhcp() && nic->GetConfiguredIpConfig().GetDhcpDns());
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Error getting IPv6 configuration. . Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
