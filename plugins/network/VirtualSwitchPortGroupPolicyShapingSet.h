#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard portgroup policy shaping set
class VirtualSwitchPortGroupPolicyShapingSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchPortGroupPolicyShapingSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
