#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic coalesce get
class NicCoalesceGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicCoalesceGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
