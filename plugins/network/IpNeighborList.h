#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip neighbor list
class IpNeighborList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpNeighborList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
