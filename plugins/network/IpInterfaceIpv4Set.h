#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface ipv4 set
class IpInterfaceIpv4Set : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceIpv4Set)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
