#include "DefaultRoute.h"

namespace KorvexCli {
namespace NetworkNamespace {

const char* const kDefaultNetworkWord = "default";

std::string NotADefaultRoute(Gantry::Network::IpAddress const& gateway) {
    return gateway.GetStringAddress() + " is not a default route.";
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
