#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network ip connection list
class IpConnectionList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(IpConnectionList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
