#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic get
class NicGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
    // The value of the field Driver Info.
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetDriverInfoStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
