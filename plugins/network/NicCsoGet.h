#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic cso get
class NicCsoGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicCsoGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
