#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip route ipv4 remove
class IpRouteIpv4Remove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpRouteIpv4Remove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
