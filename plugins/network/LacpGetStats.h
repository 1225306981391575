#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch dvs korvex lacp stats get
class LacpGetStats : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(LacpGetStats)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
