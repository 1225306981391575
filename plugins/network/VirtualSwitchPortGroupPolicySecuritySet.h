#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard portgroup policy security set
class VirtualSwitchPortGroupPolicySecuritySet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchPortGroupPolicySecuritySet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
