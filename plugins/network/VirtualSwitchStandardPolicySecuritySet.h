#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard policy security set
class VirtualSwitchStandardPolicySecuritySet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardPolicySecuritySet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
