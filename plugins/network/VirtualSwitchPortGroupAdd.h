#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard portgroup add
class VirtualSwitchPortGroupAdd : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchPortGroupAdd)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
