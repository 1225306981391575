#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip route ipv6 add
class IpRouteIpv6Add : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpRouteIpv6Add)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
