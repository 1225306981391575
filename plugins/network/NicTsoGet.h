#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic tso get
class NicTsoGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicTsoGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
