#include "IpRouteIpv6Remove.h"

#include "CommandSupport.h"
#include "DefaultRoute.h"
#include "Netstacks.h"
#include "RoutingNetstack.h"
#include "trellis/network/RoutingInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

namespace {

using Gantry::Network::Ipv6Address;
using Gantry::Network::Ipv6Network;
using Trellis::Network::RoutingInfoImpl;

const Parameter kNetwork =
    Parameter::String("network", "n",
                      "The Ipv6 address and prefix length of the network to remove the route from. Specify "
                      "'default' to indicate the default network.")
        .Required();
const Parameter kGateway =
    Parameter::String("gateway", "g", "The Ipv6 address of the gateway through which a route to be removed")
        .Required();

}  // namespace

IpRouteIpv6Remove::IpRouteIpv6Remove() {
    SetDescription("Remove IPv6 route from the Tessel");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpRouteIpv6Remove::GetInputSpecInternal() {
    return InputSpecOf(kNetwork, kGateway, kRoutingNetstack);
}

boost::shared_ptr<OutputSpec> IpRouteIpv6Remove::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpRouteIpv6Remove::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RoutingInfoImpl routing(kDefaultNetstack);
    try {
        // The addresses first: a malformed one is found before the netstack
        // is chosen.
        Ipv6Address gateway(input->GetString(kGateway));
        Ipv6Network network = RouteNetwork(input->GetString(kNetwork), RoutingInfoImpl::DEFAULT_IPV6_ROUTE);
        ChooseNetstack(routing, *input);
        if (network != RoutingInfoImpl::DEFAULT_IPV6_ROUTE) {
            routing.RemoveIpv6TesselRoute(network, gateway);
        } else if (gateway == routing.GetIpv6TesselDefaultGateway() ||
                   gateway == routing.GetIpv6TesselConfigDefaultGateway()) {
            routing.SetIpv6TesselDefaultGateway(Ipv6Address());
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
