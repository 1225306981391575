#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface ipv6 get
class IpInterfaceIpv6Get : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceIpv6Get)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
