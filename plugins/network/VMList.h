#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vm list
class VMList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VMList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
