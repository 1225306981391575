#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface ipv6 address remove
class IpInterfaceIpv6AddressRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceIpv6AddressRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
