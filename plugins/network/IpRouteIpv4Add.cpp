#include "IpRouteIpv4Add.h"

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
                      "The Ipv4 address and prefix length of the network to add the route to. Specify 'default' to "
                      "indicate the default network.")
        .Required();
const Parameter kGateway =
    Parameter::String("gateway", "g", "The Ipv4 address of the gateway through which a route to be added.")
        .Required();

}  // namespace

IpRouteIpv4Add::IpRouteIpv4Add() {
    SetDescription("Add IPv4 route to the Tessel.");
    SetMetaDataField("type", "operation");
}

boost::shared_ptr<InputSpec> IpRouteIpv4Add::GetInputSpecInternal() {
    return InputSpecOf(kNetwork, kGateway, kRoutingNetstack);
}

boost::shared_ptr<OutputSpec> IpRouteIpv4Add::GetOutputSpecInternal() { return OutputSpec::Of(MetaBool::New()); }

void IpRouteIpv4Add::ExecuteInternal(boost::shared_ptr<Input> input, boost::shared_ptr<Output> output) {
    RoutingInfoImpl routing(kDefaultNetstack);
    try {
        ChooseNetstack(routing, *input);
        Ipv4Address gateway(input->GetString(kGateway));
        Ipv4Network network = RouteNetwork(input->GetString(kNetwork), RoutingInfoImpl::DEFAULT_IPV4_ROUTE);
        // The default network too: adding its route sets the default gateway.
        routing.AddTesselRoute(network, gateway);
        output->SetResult(MetaBool::New(true));
        output->Finish();
    } catch (GantryException& e) {
        output->SetError(e.GetMessage(0));
    }
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
