#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard policy shaping set
class VirtualSwitchStandardPolicyShapingSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardPolicyShapingSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
