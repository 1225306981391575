#include "NetstackChoice.h"

#include "Netstacks.h"

namespace KorvexCli {
namespace NetworkNamespace {

const Parameter kNetstackOrDefault = Parameter::String(
    "netstack", "N", "The network stack instance; if unspecified, use the default netstack instance");

std::string ChosenNetstack(Input const& input) {
    std::string key = input.GetString(kNetstackOrDefault);
    return key.empty() ? kDefaultNetstack : key;
}

}  // namespace NetworkNamespace
}  // namespace KorvexCli
