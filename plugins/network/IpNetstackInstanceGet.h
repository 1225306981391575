#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip netstack get
class IpNetstackInstanceGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpNetstackInstanceGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
