#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard policy shaping get
class VirtualSwitchStandardPolicyShapingGet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardPolicyShapingGet)
    boost::shared_ptr<Plinth::MetaObj::MetaStruct> GetOutputStructure();
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
