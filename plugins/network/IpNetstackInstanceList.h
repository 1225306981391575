#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip netstack list
class IpNetstackInstanceList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpNetstackInstanceList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
