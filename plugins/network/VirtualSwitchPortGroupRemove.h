#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard portgroup remove
class VirtualSwitchPortGroupRemove : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchPortGroupRemove)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
