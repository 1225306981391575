#pragma once

#include <memory>
#include <string>

#include "gantry/network/IpAddress.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The address of a name server as the user typed it: IPv4 if that family
// accepts the text, else IPv6; null if neither does.
std::unique_ptr<Gantry::Network::IpAddress> ParseNameServer(std::string const& text);

// What the user is told when ParseNameServer gives null.
std::string UnrecognisedAddressText(std::string const& text);

}  // namespace NetworkNamespace
}  // namespace KorvexCli
