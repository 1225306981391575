#pragma once

#include "plinth/autocli/CommandClass.h"

namespace KorvexCli {
namespace NetworkNamespace {

// network vswitch standard set
class VirtualSwitchStandardSet : public virtual Plinth::AutoCli::Command {
    PLINTH_COMMAND_CLASS(VirtualSwitchStandardSet)
};

}  // namespace NetworkNamespace
}  // namespace KorvexCli
