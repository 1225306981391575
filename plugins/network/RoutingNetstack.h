#pragma once

#include "CommandSupport.h"
#include "trellis/network/RoutingInfoImpl.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The netstack option of the route and neighbour commands.
extern const Parameter kRoutingNetstack;

// Turns the routing, built on the default instance, to the instance of the
// netstack option; an empty or absent option keeps the default.
void ChooseNetstack(Trellis::Network::RoutingInfoImpl& routing, Input& input);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
