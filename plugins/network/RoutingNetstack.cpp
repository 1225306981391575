#include "RoutingNetstack.h"

#include <string>

namespace KorvexCli {
namespace NetworkNamespace {

const Parameter kRoutingNetstack = Parameter::String(
    "netstack", "N", "The network stack instance; if unspecified, use the default netstack instance");

void ChooseNetstack(Trellis::Network::RoutingInfoImpl& routing, Input& input) {
    std::string netstack = input.GetString(kRoutingNetstack);
    if (!netstack.empty()) routing.SetNetstackInstanceKey(netstack);
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
