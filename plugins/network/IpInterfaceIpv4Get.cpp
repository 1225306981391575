#include "IpInterfaceIpv4Get.h"

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "gantry/network/IpConfig.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

const Parameter kNetstack = Parameter::String(
    "netstack", "N", "The network stack instance; if unspecified, consider all netstack instances");
const Parameter kInterfaceName = Parameter::String(
    "interface-name", "i", "The name of the Tessel network interface to limit the output of this command to.");

}  // namespace

IpInterfaceIpv4Get::IpInterfaceIpv4Get() {
    SetDescription("Get IPv4 settings for Tessel network interfaces.");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:IPv4Interface",
                              "Name,IPv4 Address,IPv4 Netmask,IPv4 Broadcast,Address Type,DHCP DNS");
}

boost::shared_ptr<InputSpec> IpInterfaceIpv4Get::GetInputSpecInternal() {
    return InputSpecOf(kNetstack, kInterfaceName);
}

boost::shared_ptr<OutputSpec> IpInterfaceIpv4Get::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpInterfaceIpv4Get::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("IPv4Interface");
    result->SetField("Name", MetaString::New());
    result->SetField("IPv4 Address", MetaString::New());
    result->SetField("IPv4 Netmask", MetaString::New());
    result->SetField("IPv4 Broadcast", MetaString::New());
    result->SetField("Address Type", MetaString::New());
    result->SetField("DHCP DNS", MetaBool::New());
    return result;
}

void IpInterfaceIpv4Get::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
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
            entry->SetField("IPv4 Address", config.GetIpv4Address().GetStringAddress());
            entry->SetField("IPv4 Netmask", config.GetIpv4Netmask().GetStringAddress());
            entry->SetField("IPv4 Broadcast", config.GetIpv4Broadcast().GetStringAddress());
            std::string type = "STATIC";
            bool dhcpDns = false;
            if (config.GetUseDhcp()) {
                type = "DHCP";
                dhcpDns = nic->GetConfiguredIpConfig().GetDhcpDns();
            } else if (config.GetIpv4UseNone()) {
                type = "NONE";
            }
            entry->SetField("Address Type", type);
            entry->SetField("DHCP DNS", dhcpDns);
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Error getting IPv4 configuration. . Error was : " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
