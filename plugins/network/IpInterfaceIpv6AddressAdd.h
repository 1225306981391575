#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface ipv6 address add
class IpInterfaceIpv6AddressAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceIpv6AddressAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
