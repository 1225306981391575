#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network nic pauseParams list
class NicPauseParamsList : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(NicPauseParamsList)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
