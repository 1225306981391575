#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vm port list
class VMPortList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VMPortList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
