#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface ipv4 get
class IpInterfaceIpv4Get : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceIpv4Get)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
