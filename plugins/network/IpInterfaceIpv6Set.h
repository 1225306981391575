#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface ipv6 set
class IpInterfaceIpv6Set : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceIpv6Set)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
