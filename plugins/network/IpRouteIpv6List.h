#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip route ipv6 list
class IpRouteIpv6List : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpRouteIpv6List)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
