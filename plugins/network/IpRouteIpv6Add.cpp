#include "IpRouteIpv6Add.h"

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
                      "The Ipv6 address and prefix length of the network to add the route to. Specify 'default' to "
                      "indicate the default network.")
        .Required();
const Parameter kGateway =
    Parameter::String("gateway", "g", "The Ipv6 address of the gateway through which a route to be added.")
        .Required();

}  // namespace

IpRouteIpv6Add::IpRouteIpv6Add() {
    SetDescription("Add IPv6 route to the Tessel.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpRouteIpv6Add::GetInputSpecInternal() {
    return InputSpecOf(kNetwork, kGateway, kRoutingNetstack);
}

boost::shared_ptr<OutputSpec> IpRouteIpv6Add::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpRouteIpv6Add::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RoutingInfoImpl routing(kDefaultNetstack);
    try {
        ChooseNetstack(routing, *input);
        Ipv6Address gateway(input->GetString(kGateway));
        Ipv6Network network = RouteNetwork(input->GetString(kNetwork), RoutingInfoImpl::DEFAULT_IPV6_ROUTE);
        // The default network too: adding its route sets the default gateway.
        routing.AddIpv6TesselRoute(network, gateway);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
