#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip route ipv6 remove
class IpRouteIpv6Remove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpRouteIpv6Remove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
