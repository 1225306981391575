#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic software list
class NicSoftwareList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicSoftwareList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
