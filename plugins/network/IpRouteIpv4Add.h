#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip route ipv4 add
class IpRouteIpv4Add : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpRouteIpv4Add)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
