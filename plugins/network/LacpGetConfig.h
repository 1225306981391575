#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch dvs korvex lacp config get
class LacpGetConfig : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(LacpGetConfig)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
