#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip interface tag get
class IpInterfaceTagGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpInterfaceTagGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
