#include "IpRouteIpv4Remove.h"

#include "CommandSupport.h"
#include "DefaultRoute.h"
#include "Netstacks.h"
#include "RoutingNetstack.h"
#include "trellis/network/RoutingInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::Ipv4Address;
using Gantry::Network::Ipv4Network;
using Trellis::Network::RoutingInfoImpl;

const Parameter kNetwork =
    Parameter::String("network", "n",
                      "The Ipv4 address and prefix length of the network to remove the route from. Specify "
                      "'default' to indicate the default network.")
        .Required();
const Parameter kGateway =
    Parameter::String("gateway", "g", "The Ipv4 address of the gateway through which a route to be removed")
        .Required();

}  // namespace

IpRouteIpv4Remove::IpRouteIpv4Remove() {
    SetDescription("Remove IPv4 route");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpRouteIpv4Remove::GetInputSpecInternal() {
    return InputSpecOf(kNetwork, kGateway, kRoutingNetstack);
}

boost::shared_ptr<OutputSpec> IpRouteIpv4Remove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpRouteIpv4Remove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RoutingInfoImpl routing(kDefaultNetstack);
    try {
        ChooseNetstack(routing, *input);
        Ipv4Address gateway(input->GetString(kGateway));
        Ipv4Network network = RouteNetwork(input->GetString(kNetwork), RoutingInfoImpl::DEFAULT_IPV4_ROUTE);
        if (network != RoutingInfoImpl::DEFAULT_IPV4_ROUTE) {
            routing.RemoveTesselRoute(network, gateway);
        } else if (gateway == routing.GetTesselDefaultGateway() || gateway == routing.GetTesselConfigDefaultGateway()) {
            routing.SetTesselDefaultGateway(Ipv4Address("0.0.0.0"), false);
        } else {
            // Reported, and the command still delivers true.
            output->SetError(NotADefaultRoute(gateway));
        }
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
