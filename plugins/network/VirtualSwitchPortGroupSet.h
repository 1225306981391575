#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard portgroup set
class VirtualSwitchPortGroupSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchPortGroupSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
