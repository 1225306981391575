#include "IpInterfaceIpv6AddressList.h"

#include "CommandSupport.h"
#include "InterfaceLookup.h"
#include "gantry/network/Ipv6Network.h"
#include "trellis/network/TesselNicInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Network::Ipv6Network;

namespace {

const Parameter kInterfaceName = Parameter::String(
    "interface-name", "i", "The name of the Tessel network interface to limit the output of this command to.");

std::string TypeText(int type) {
    switch (type) {
    case Ipv6Network::TYPE_STATIC: return "STATIC";
    case Ipv6Network::TYPE_AUTOCONF: return "AUTOCONF";
    case Ipv6Network::TYPE_DHCP: return "DHCP";
    default: return "";
    }
}

std::string StatusText(int status) {
    switch (status) {
    case Ipv6Network::STATUS_TENTATIVE: return "TENTATIVE";
    case Ipv6Network::STATUS_DUPLICATED: return "DUPLICATED";
    case Ipv6Network::STATUS_DEPRECATED: return "DEPRECATED";
    default: return "PREFERRED";
    }
}

}  // namespace

IpInterfaceIpv6AddressList::IpInterfaceIpv6AddressList() {
    SetDescription("This command will list all of the IPv6 addresses currently assigned to the system");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:IPv6Interface", "Interface,Address,Netmask,Type,Status");
}

boost::shared_ptr<InputSpec> IpInterfaceIpv6AddressList::GetInputSpecInternal() { return InputSpecOf(kInterfaceName); }

boost::shared_ptr<OutputSpec> IpInterfaceIpv6AddressList::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpInterfaceIpv6AddressList::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("IPv6Interface");
    result->SetField("Interface", MetaString::New());
    result->SetField("Address", MetaString::New());
    result->SetField("Netmask", MetaInt::New());
    result->SetField("Type", MetaString::New());
    result->SetField("Status", MetaString::New());
    return result;
}

void IpInterfaceIpv6AddressList::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    Trellis::Network::TesselNicInfoImpl nicInfo;
    try {
        std::string name = input->GetString(kInterfaceName);
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        OwnedVector<Gantry::Network::TslNic> nics;
        if (!SelectInterfaces(nicInfo, *output, name, "", nics)) return;
        for (Gantry::Network::TslNic* nic : nics) {
            for (Ipv6Network const& network : nic->GetIpConfig().GetIpv6Network()) {
                boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
                entry->SetField("Interface", nic->GetName());
                entry->SetField("Address", network.GetAddress().GetStringAddress());
                entry->SetField("Netmask", static_cast<long long>(network.GetNetmask()));
                entry->SetField("Type", TypeText(network.GetIpv6AddressType()));
                entry->SetField("Status", StatusText(network.GetIpv6AddressStatus()));
                result->AddMetaStruct(entry);
            }
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError("Unable to list IPv6 Addresses. Error was: " + e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
