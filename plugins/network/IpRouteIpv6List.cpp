#include "IpRouteIpv6List.h"

#include <vector>

#include "CommandSupport.h"
#include "DefaultRoute.h"
#include "Netstacks.h"
#include "RoutingNetstack.h"
#include "trellis/network/RoutingInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Gantry::Network::Ipv6Network;
using Trellis::Network::RoutingInfoImpl;

IpRouteIpv6List::IpRouteIpv6List() {
    SetDescription("List configured IPv6 routes");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:Ipv6Route", "Network,Netmask,Gateway,Interface");
}

boost::shared_ptr<InputSpec> IpRouteIpv6List::GetInputSpecInternal() { return InputSpecOf(kRoutingNetstack); }

boost::shared_ptr<OutputSpec> IpRouteIpv6List::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpRouteIpv6List::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Ipv6Route");
    result->SetField("Network", MetaString::New());
    result->SetField("Netmask", MetaString::New());
    result->SetField("Gateway", MetaString::New());
    result->SetField("Interface", MetaString::New());
    return result;
}

void IpRouteIpv6List::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RoutingInfoImpl routing(kDefaultNetstack);
    try {
        ChooseNetstack(routing, *input);
        std::vector<Gantry::Network::Ipv6Route> routes = routing.GetCurrentIpv6TesselRoutes();
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (Gantry::Network::Ipv6Route const& route : routes) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            // The prefix length shown as a mask address.
            entry->SetField("Netmask", Ipv6Network::NetmaskFromNumber(route.network.GetNetmask()).GetStringAddress());
            entry->SetField("Interface", route.interfaceName);
            entry->SetField("Network", route.network == RoutingInfoImpl::DEFAULT_IPV6_ROUTE
                                           ? kDefaultNetworkWord
                                           : route.network.GetAddress().GetStringAddress());
            entry->SetField("Gateway", route.gateway.GetStringAddress());
            result->AddMetaStruct(entry);
        }
        output->SetResult(result);
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
