#include "IpRouteIpv4List.h"

#include <vector>

#include "CommandSupport.h"
#include "DefaultRoute.h"
#include "Netstacks.h"
#include "RoutingNetstack.h"
#include "trellis/network/RoutingInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

using Trellis::Network::RoutingInfoImpl;

IpRouteIpv4List::IpRouteIpv4List() {
    SetDescription("List configured IPv4 routes");
    SetMetaDataField("type", "fetcher");
    SetDefaultOutputFormatter("table");
    SetDefaultOutputParameter("fields:Ipv4Route", "Network,Netmask,Gateway,Interface,Source");
}

boost::shared_ptr<InputSpec> IpRouteIpv4List::GetInputSpecInternal() { return InputSpecOf(kRoutingNetstack); }

boost::shared_ptr<OutputSpec> IpRouteIpv4List::GetOutputSpecInternal() {
    return OutputSpec::Of(MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure()));
}

boost::shared_ptr<MetaStruct> IpRouteIpv4List::GetOutputStructure() {
    boost::shared_ptr<MetaStruct> result = MetaStruct::New("Ipv4Route");
    result->SetField("Network", MetaString::New());
    result->SetField("Netmask", MetaString::New());
    result->SetField("Gateway", MetaString::New());
    result->SetField("Interface", MetaString::New());
    result->SetField("Source", MetaString::New());
    return result;
}

void IpRouteIpv4List::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RoutingInfoImpl routing(kDefaultNetstack);
    try {
        ChooseNetstack(routing, *input);
        std::vector<Gantry::Network::Ipv4Route> routes = routing.GetCurrentTesselRoutes();
        boost::shared_ptr<MetaList> result = MetaList::New(Plinth::MetaObj::META_STRUCT, GetOutputStructure());
        for (Gantry::Network::Ipv4Route const& route : routes) {
            boost::shared_ptr<MetaStruct> entry = GetOutputStructure();
            entry->SetField("Netmask", route.network.GetNetmask().GetStringAddress());
            entry->SetField("Interface", route.interfaceName);
            entry->SetField("Network", route.network == RoutingInfoImpl::DEFAULT_IPV4_ROUTE
                                           ? kDefaultNetworkWord
                                           : route.network.GetNetwork().GetStringAddress());
            entry->SetField("Gateway", route.gateway.GetStringAddress());
            // Asked for every route, not only the default one.
            entry->SetField("Source", routing.GetDefaultGatewaySource(route.network));
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
