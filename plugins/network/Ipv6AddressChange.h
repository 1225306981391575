#pragma once

#include <string>

#include "CommandSupport.h"
#include "gantry/network/IpConfig.h"

namespace KorvexCli {
namespace NetworkNamespace {

// The steps that ipv6 address add and ipv6 address remove share, from their
// options interfaceOption and ipv6Option; change is the configuration's call
// that differs (AddIpv6Network or RemoveIpv6Network). The address's form is
// checked before the host is asked anything.
void ChangeIpv6Address(Input& input, Output& output, std::string const& interfaceOption, std::string const& ipv6Option,
                       void (Gantry::Network::IpConfig::*change)(Gantry::Network::Ipv6Network const&));

}  // namespace NetworkNamespace
}  // namespace KorvexCli
